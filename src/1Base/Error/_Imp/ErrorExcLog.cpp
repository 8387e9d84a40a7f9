#include "1Base/Error/ErrorExcLog.h"

namespace Error {
namespace Detail {

std::string buildLogText(CException const& exc) {
    CMessage const message(exc.getInfo().getMessage());
    message.insertParameters(true);
    return message.getString<std::string>(false);
}

} // namespace Detail
} // namespace Error
