#include "1Base/Error/ErrorException.h"

#include "1Base/Error/_Imp/ErrorText.h"

namespace Error {
namespace {

template <class TStream>
void writeException(TStream& stream, CException const& exc, bool detailed) {
    if (detailed) {
        Detail::writeText(stream, "'");
        Detail::writeText(stream, exc.getExcName());
        Detail::writeText(stream, "': ");
    }
    exc.getInfo().writeTo(stream, detailed);
    if (detailed) {
        // The blank stands also where no block was passed: readers split at it.
        Detail::writeText(stream, " ");
        exc.getStackInfo().writeTo(stream, detailed);
    }
}

} // namespace

void CException::writeTo(std::ostream& stream, bool detailed) const {
    writeException(stream, *this, detailed);
}

void CException::writeTo(std::wostream& stream, bool detailed) const {
    writeException(stream, *this, detailed);
}

std::wostream& operator<<(std::wostream& stream, CException const& exc) {
    exc.writeTo(stream, false);
    return stream;
}

} // namespace Error
