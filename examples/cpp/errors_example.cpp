// Raises an exception through two guarded blocks, logs it, shows its text and counts its trace.
//
// Prints:
//     FileSys [SevError] setting language was not found
//     FileSpec: setting language was not found
//     passed 2 guarded blocks
//     wrapped: "setting language was not found"

#include "1Base/Error/Error.h"
#include "2System/FileSys/FileSysExc.h"
#include "2System/SysInfo/SysInfoExc.h"

#include <iostream>
#include <string>

namespace {

void readSetting(std::string const& key) {
    ERROR_BLOCK_BEGIN
    std::string const type = "setting";
    ERROR_THROW(FileSys::TExcFileSpec, Error::msgNotFound,
                ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key)));
    ERROR_BLOCK_END
}

void start() {
    ERROR_BLOCK_BEGIN
    readSetting("language");
    ERROR_BLOCK_END
}

// A target decides by itself what a record looks like.
class CConsoleTarget : public Error::CLogTarget {
  public:
    void write(char const*, unsigned int, char const*, char const*, char const*, char const* tag,
               char const*, char const* severity, Error::CMessage const& message) const override {
        std::cout << tag << " [" << severity << "] " << message << "\n";
    }
};

} // namespace

int main() {
    CConsoleTarget const target;
    Error::CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevError>(&target);

    try {
        start();
    } catch (TExcSystem const& exc) {
        Error::log<FileSys::TLoggerFileSys, Error::TTgtLogger>(exc);
        std::cout << exc.getExcName() << ": " << exc.getInfo().getMessage() << "\n";
        unsigned int blocks = 0;
        for (Error::CStackInfo const& block : exc.getStackInfo())
            blocks += block.getLineBegin() < block.getLineEnd() ? 1U : 0U;
        std::cout << "passed " << blocks << " guarded blocks\n";

        // Another chain, for callers who know nothing of files: the text stays, the trace begins
        // anew.
        Error::XExc<SysInfo::TExcPreferenceFolder> const wrapper(ERROR_ORIGIN, exc);
        std::cout << "wrapped: " << wrapper.getInfo().getMessage() << "\n";
    }

    Error::CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevError>(&target);
}
