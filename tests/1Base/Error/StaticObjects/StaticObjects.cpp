#include "1Base/Error/StaticObjects/StaticObjects.h"

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/StdUtil/StdUtilSingleton.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <stdexcept>
#include <string>

namespace StaticObjects {
namespace {

void check(bool isRight, char const* what) {
    if (isRight)
        return;
    std::fprintf(stderr, "wrong: %s\n", what);
    std::_Exit(1);
}

#define CHECK(...) check(__VA_ARGS__, #__VA_ARGS__)

std::string plainTextOf(Error::CException const& exc) {
    std::ostringstream stream;
    stream << exc.getExcName() << ": " << exc.getInfo().getMessage();
    return stream.str();
}

void raise() {
    ERROR_BLOCK_BEGIN
    std::string const key = "caf\xC3\xA9";
    ERROR_THROW(Encoding::TExcEncoding, Error::msgNotFound,
                ERROR_PARAMS(Error::buildNamedParameter("type", "key"), ERROR_PARAM(key)));
    ERROR_BLOCK_END
}

void raiseStandard() {
    ERROR_BLOCK_BEGIN
    throw std::runtime_error("standard");
    ERROR_BLOCK_END
}

template <class TRaise>
std::string caught(TRaise const& raiseIt) {
    try {
        raiseIt();
    } catch (Error::CException const& exc) {
        Error::log<Error::TLoggerError, Error::TTgtLogger>(exc);
        return plainTextOf(exc);
    }
    return "nothing";
}

} // namespace

void CUser::CCounter::exceptionAdded(Error::CExcImplementation const*, Error::CInfo const&) const {
    ++added;
}

void CUser::CCounter::exceptionRemoved(Error::CExcImplementation const*) const {
    ++removed;
}

void CUser::CCounter::write(char const*, unsigned int, char const*, char const*, char const*,
                            char const*, char const*, char const*,
                            Error::CMessage const& message) const {
    CHECK(!message.getString(true).empty());
    ++written;
}

CUser::CUser(char const* name) : name_(name), alive_(ERROR_ORIGIN, Error::msgDuplicate) {
    Error::CExcImplementation::accessRegistry()->registerObserver(&counter_);
    Error::CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevError>(&counter_);
    Error::CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevFatal>(&counter_);
    use();
    say("start");
}

CUser::~CUser() {
    use();
    auto const live = Error::CExcImplementation::accessRegistry()->getExceptions();
    CHECK(std::find(live.begin(), live.end(), &alive_) != live.end());
    CHECK(Error::CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevFatal>(&counter_));
    CHECK(Error::CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevError>(&counter_));
    Error::CExcImplementation::accessRegistry()->unregisterObserver(&counter_);
    say("end");
}

void CUser::use() const {
    int const added = counter_.added;
    int const removed = counter_.removed;
    int const written = counter_.written;
    CHECK(caught(raise) == "Encoding: key caf\xC3\xA9 was not found");
    CHECK(caught(raiseStandard) ==
          "StdLibException: Standard library exception of type 'St13runtime_error' caught.\n"
          "Message: \"standard\"");
    CHECK(caught([] { ERROR_ASSERT(1 > 2); }).find("ErrorAssert: Assertion failed in file ") == 0);
    // Three exceptions came and went; each was logged, and the assertion's report too.
    CHECK(counter_.added == added + 3);
    CHECK(counter_.removed == removed + 3);
    CHECK(counter_.written == written + 4);
    CHECK(&StdUtil::CSingleton::get<std::string>() == &StdUtil::CSingleton::get<std::string>());
}

void CUser::say(char const* when) const {
    std::printf("%s %s\n", name_, when);
}

} // namespace StaticObjects
