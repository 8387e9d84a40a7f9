/// What an exception of the family says, as plain values that outlive it.
///
///     TestSupport::CRaised const raised =
///         TestSupport::raisedBy<FileSys::TExcFileSpec>([&] { missing.getFileInfo(); });
///     raised.name;         // "FileInfo"
///     raised.text;         // the template, to compare with Error::loadDefaultMessage
///     raised.trace.at(0);  // the signature of the first guarded block that it passed
#ifndef QORN_TESTS_RAISEDEXCEPTION_H
#define QORN_TESTS_RAISEDEXCEPTION_H

#include "1Base/Error/ErrorExc.h"

#include "support/MessageParameters.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace TestSupport {

struct CRaised {
    std::string name;
    Error::ESeverity severity = Error::SevDebug;
    Strings::string text;
    TParameters parameters;
    std::string file;
    std::string func;
    std::vector<std::string> trace;
};

inline CRaised raisedOf(Error::CException const& exc) {
    Error::CInfo const& info = exc.getInfo();
    CRaised raised = {exc.getExcName(),
                      info.getSeverity(),
                      info.getMessage().getString(false),
                      parametersOf(info.getMessage()),
                      info.getOrigin().getFile(),
                      info.getOrigin().getFunc(),
                      {}};
    for (Error::CStackInfo const& block : exc.getStackInfo())
        raised.trace.push_back(block.getFunc());
    return raised;
}

/// What `call` raises, caught as TExcX, which fails the test where it is nothing. Another exception
/// passes.
template <class TExcX, class TCall>
CRaised raisedBy(TCall const& call) {
    try {
        call();
        ADD_FAILURE() << "nothing was raised";
    } catch (TExcX const& exc) {
        return raisedOf(exc);
    }
    return CRaised();
}

} // namespace TestSupport

#endif
