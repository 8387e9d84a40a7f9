/// What an operation on files ended in, as plain values to compare.
///
///     TestSupport::CFileFailure const failure =
///         TestSupport::failureOf([] { FileSys::createFolder(FileSys::CFileSpec()); });
///     failure.name;    // "FileSpec"
///     failure.trace;   // "doCreateFolder", "createFolder"
#ifndef QORN_TESTS_FILEFAILURES_H
#define QORN_TESTS_FILEFAILURES_H

#include "1Base/Encoding/EncodingConverter.h"
#include "2System/FileSys/FileSysExc.h"

#include "support/RaisedException.h"

#include <boost/filesystem/operations.hpp>

#include <gtest/gtest.h>

#include <cctype>
#include <string>
#include <system_error>
#include <vector>

namespace TestSupport {

/// The name in a signature: "doCopyFile" of "void FileSys::Detail::doCopyFile(...)".
inline std::string functionNameOf(std::string const& signature) {
    auto const isName = [](char character) {
        return std::isalnum(static_cast<unsigned char>(character)) != 0 || character == '_';
    };
    for (std::size_t end = signature.find('('); end != std::string::npos;
         end = signature.find('(', end + 1)) {
        std::size_t begin = end;
        while (begin > 0 && isName(signature[begin - 1]))
            --begin;
        // An anonymous namespace has a parenthesis as well.
        if (begin < end)
            return signature.substr(begin, end - begin);
    }
    return signature;
}

/// An exception as it left a call; with an empty name where none did. Its trace holds the bare
/// names of functions, the innermost first.
struct CFileFailure : CRaised {
    bool isFileSpec = false; // which handlers take it
    bool isFileSysOp = false;
    unsigned int line = 0;
    std::string function;
    Strings::string message;
};

inline CFileFailure describe(Error::CException const& exc) {
    CFileFailure failure;
    static_cast<CRaised&>(failure) = raisedOf(exc);
    for (std::string& signature : failure.trace)
        signature = functionNameOf(signature);
    failure.isFileSpec = dynamic_cast<FileSys::TExcFileSpec const*>(&exc) != nullptr;
    failure.isFileSysOp = dynamic_cast<FileSys::TExcFileSysOp const*>(&exc) != nullptr;
    failure.line = exc.getInfo().getOrigin().getLine();
    failure.function = functionNameOf(failure.func);
    failure.message = exc.getInfo().getMessage().getString(true);
    return failure;
}

template <class TCall>
CFileFailure failureOf(TCall const& call) {
    try {
        call();
    } catch (Error::CException const& exc) {
        return describe(exc);
    }
    return CFileFailure();
}

/// Checks a failure: its chain ("FileSpec" or "OSFile"), its text, its parameters in their order,
/// and the blocks that it passed, of which the first raised it.
inline void expectFailure(CFileFailure const& failure, std::string const& chain, Error::EMsgID id,
                          TParameters const& parameters, std::vector<std::string> const& trace) {
    EXPECT_EQ(failure.name, chain);
    EXPECT_TRUE(failure.isFileSpec);
    EXPECT_EQ(failure.isFileSysOp, chain == "OSFile");
    EXPECT_EQ(failure.text, Error::loadDefaultMessage(id));
    EXPECT_EQ(failure.parameters, parameters);
    EXPECT_NE(failure.file.find("2System/FileSys/_Imp/FileSysOperations"), std::string::npos)
        << failure.file;
    EXPECT_GT(failure.line, 0U);
    EXPECT_EQ(failure.function, trace.front());
    EXPECT_EQ(failure.trace, trace);
}

/// The parameters of "Could not ...", of "Argument ... is wrong", in their order.
inline TParameters couldNot(Strings::string const& process, Strings::string const& type,
                            Strings::string const& key, Strings::string const& reason) {
    return {{"process", process}, {"type", type}, {"key", key}, {"reason", reason}};
}

inline TParameters wrongFile(Strings::string const& key, Strings::string const& reason) {
    return {{"type", L"file"}, {"key", key}, {"reason", reason}};
}

/// An ASCII text, and other text whose bytes are UTF-8, as a wide one.
inline Strings::string wide(std::string const& text) {
    return Encoding::convert<Strings::string>(text);
}

/// What the path library says of a folder that can't be made; asking changes nothing then.
inline Strings::string reasonOfNoFolder(std::string const& folder) {
    boost::system::error_code error;
    boost::filesystem::create_directories(folder, error);
    return error ? wide(error.message()) : Strings::string();
}

/// The system's own text of an error.
inline Strings::string errorText(int error) {
    return wide(std::generic_category().message(error));
}

} // namespace TestSupport

#endif
