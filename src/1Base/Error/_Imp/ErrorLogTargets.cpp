#include "1Base/Error/ErrorLogTargets.h"

#include "1Base/Encoding/EncodingConverter.h"

#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <ostream>
#include <string>

namespace Error {
namespace {

bool isBelow(char const* severity, ESeverity least) {
    for (int value = SevDebug; value < least; ++value)
        if (std::strcmp(severity, getSeverityName(static_cast<ESeverity>(value))) == 0)
            return true;
    return false;
}

bool isNoCharacter(wchar_t element) {
    auto const code = static_cast<char32_t>(element);
    return code > 0x10FFFF || (code >= 0xD800 && code <= 0xDFFF);
}

// The expanded text on one line, behind a blank. A target must not raise, and the conversion would
// for what is no character, and for a lone byte order mark.
std::string buildText(CMessage const& message) {
    Strings::string text = L" " + message.getString(true);
    std::replace(text.begin(), text.end(), L'\n', L' ');
    std::replace_if(text.begin(), text.end(), isNoCharacter, L'\uFFFD');
    return Encoding::convert<std::string>(text);
}

std::string buildLine(char const* file, unsigned int line, char const* tag, char const* severity,
                      CMessage const& message) {
    return std::string("[") + severity + "] " + tag + ":" + buildText(message) + " (" + file +
           " #" + std::to_string(line) + ")\n";
}

} // namespace

CStreamLogTarget::CStreamLogTarget(std::ostream& stream, ESeverity least)
    : stream_(stream), least_(least) {}

void CStreamLogTarget::write(char const* file, unsigned int line, char const*, char const*,
                             char const*, char const* tag, char const*, char const* severity,
                             CMessage const& message) const {
    if (!isBelow(severity, least_))
        stream_ << buildLine(file, line, tag, severity, message) << std::flush;
}

CFileLogTarget::CFileLogTarget(wchar_t const* path, ESeverity least)
    : descriptor_(::open(Encoding::convert<std::string>(path).c_str(),
                         O_WRONLY | O_APPEND | O_CREAT | O_CLOEXEC, 0666)),
      least_(least) {}

CFileLogTarget::~CFileLogTarget() {
    if (is_open())
        ::close(descriptor_);
}

void CFileLogTarget::write(char const* file, unsigned int line, char const*, char const*,
                           char const*, char const* tag, char const*, char const* severity,
                           CMessage const& message) const {
    if (!is_open() || isBelow(severity, least_))
        return;
    std::string text = buildLine(file, line, tag, severity, message);
    if (torn_)
        text.insert(0, 1, '\n');
    ssize_t written;
    do
        written = ::write(descriptor_, text.data(), text.size());
    while (written < 0 && errno == EINTR);
    if (written > 0)
        torn_ = static_cast<std::size_t>(written) < text.size();
}

} // namespace Error
