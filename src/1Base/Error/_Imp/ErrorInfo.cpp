#include "1Base/Error/ErrorInfo.h"

#include "1Base/Error/_Imp/ErrorText.h"

#include <iomanip>
#include <ostream>

namespace Error {

using Detail::writeText;

namespace {

// A signature has parentheses of its own; the fixed "()" follows all the same.
template <class TStream, class TPlace>
void writeDetails(TStream& stream, TPlace const& place) {
    writeText(stream, ", '");
    writeText(stream, place.getFunc());
    writeText(stream, "()', (");
    writeText(stream, place.getDate());
    writeText(stream, ", ");
    writeText(stream, place.getTime());
    writeText(stream, ")");
}

template <class TStream>
void writeOrigin(TStream& stream, COrigin const& origin, bool detailed) {
    writeText(stream, origin.getFile());
    writeText(stream, " #");
    stream << std::setw(3) << std::right << origin.getLine();
    if (detailed)
        writeDetails(stream, origin);
}

template <class TStream>
void writeInfo(TStream& stream, CInfo const& info, bool detailed) {
    info.getOrigin().writeTo(stream, detailed);
    writeText(stream, ": [");
    writeText(stream, getSeverityName(info.getSeverity()));
    writeText(stream, "] \"");
    info.getMessage().insertParameters(detailed);
    stream << info.getMessage();
    writeText(stream, "\"");
}

template <class TStream>
void writeStackInfo(TStream& stream, CStackInfo const& info, bool detailed) {
    writeText(stream, info.getFile());
    writeText(stream, " [#");
    stream << info.getLineBegin();
    writeText(stream, "...#");
    stream << info.getLineEnd();
    writeText(stream, "]");
    if (detailed)
        writeDetails(stream, info);
    writeText(stream, " ");
}

template <class TStream>
void writeStackInfoList(TStream& stream, CStackInfoList const& list, bool detailed) {
    for (CStackInfo const& info : list)
        info.writeTo(stream, detailed);
}

} // namespace

void COrigin::writeTo(std::ostream& stream, bool detailed) const {
    writeOrigin(stream, *this, detailed);
}

void COrigin::writeTo(std::wostream& stream, bool detailed) const {
    writeOrigin(stream, *this, detailed);
}

void CInfo::writeTo(std::ostream& stream, bool detailed) const {
    writeInfo(stream, *this, detailed);
}

void CInfo::writeTo(std::wostream& stream, bool detailed) const {
    writeInfo(stream, *this, detailed);
}

void CStackInfo::writeTo(std::ostream& stream, bool detailed) const {
    writeStackInfo(stream, *this, detailed);
}

void CStackInfo::writeTo(std::wostream& stream, bool detailed) const {
    writeStackInfo(stream, *this, detailed);
}

void CStackInfoList::writeTo(std::ostream& stream, bool detailed) const {
    writeStackInfoList(stream, *this, detailed);
}

void CStackInfoList::writeTo(std::wostream& stream, bool detailed) const {
    writeStackInfoList(stream, *this, detailed);
}

} // namespace Error
