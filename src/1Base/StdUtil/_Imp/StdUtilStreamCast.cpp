// A plain standard exception, until the error module brings its own family.

#include "1Base/StdUtil/StdUtilStreamCastFailures.h"

namespace StdUtil {
namespace Detail {

XStreamCast::XStreamCast(std::string const& source_, std::string const& target_)
    : std::runtime_error("Could not cast '" + source_ + "' to '" + target_ + "'"),
      source(source_),
      target(target_) {}

void throwStreamCastError(char const* /*file*/, unsigned int /*line*/, char const* /*func*/,
                          char const* /*date*/, char const* /*time*/, char const* source,
                          char const* target) {
    throw XStreamCast(source, target);
}

} // namespace Detail
} // namespace StdUtil
