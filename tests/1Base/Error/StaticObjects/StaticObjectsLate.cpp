// Linked behind the libraries, and so made after their static objects.

#include "1Base/Error/StaticObjects/StaticObjects.h"

namespace {

StaticObjects::CUser const late("late");

} // namespace
