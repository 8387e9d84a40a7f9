// What a failed cast raises.

#include "1Base/Error/Error.h"
#include "1Base/StdUtil/StdUtilExc.h"
#include "1Base/StdUtil/StdUtilStreamCast.h"

#include "support/MessageParameters.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <ostream>
#include <sstream>
#include <stdexcept>
#include <string>
#include <typeinfo>

namespace {

using StdUtil::stream_cast;
using TestSupport::parametersOf;
using TestSupport::TParameters;

using CStdUtilStreamCastFailuresTest = TestSupport::CErrorTest;

Strings::string wide(std::string const& ascii) {
    return Strings::string(ascii.begin(), ascii.end());
}

void expectStreamCast(Error::CException const& exc, std::string const& source,
                      std::string const& target) {
    EXPECT_STREQ(exc.getExcName(), "StreamCast");
    EXPECT_NE(dynamic_cast<StdUtil::TExcStreamCast const*>(&exc), nullptr);
    Error::CMessage const& message = exc.getInfo().getMessage();
    EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
    EXPECT_EQ(message.getString(false), L"Could not cast '@(source)' to '@(target)'");
    EXPECT_EQ(parametersOf(message),
              (TParameters{{"source", wide(source)}, {"target", wide(target)}}));
    EXPECT_EQ(message.getString(true),
              L"Could not cast '" + wide(source) + L"' to '" + wide(target) + L"'");
    EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
}

template <class TNumber>
void expectNoNumber(Strings::string const& text, char const* rawName) {
    try {
        stream_cast<TNumber>(text);
        FAIL();
    } catch (Error::CException const& exc) {
        expectStreamCast(exc, typeid(Strings::string).name(), rawName);
        EXPECT_NE(std::string(exc.getInfo().getOrigin().getFile()).find("/1Base/StdUtil/"),
                  std::string::npos);
        EXPECT_NE(std::string(exc.getInfo().getOrigin().getFunc()).find("cast"), std::string::npos);
    }
}

TEST_F(CStdUtilStreamCastFailuresTest, ATextThatIsNoNumberRaisesTheCompilersNames) {
    expectNoNumber<int>(L"abc", "i");
    expectNoNumber<int>(L"", "i");
    expectNoNumber<int>(L" \t", "i");
    expectNoNumber<unsigned int>(L"x1", "j");
    expectNoNumber<unsigned short>(L"65536", "t");
    expectNoNumber<long>(L"-", "l");
}

class CUncastable {};

std::wostream& operator<<(std::wostream& stream, CUncastable const&) {
    stream.setstate(std::ios_base::badbit);
    return stream;
}

TEST_F(CStdUtilStreamCastFailuresTest, AValueThatAStreamRefusesRaises) {
    try {
        stream_cast<Strings::string>(CUncastable());
        FAIL();
    } catch (StdUtil::TExcStreamCast const& exc) {
        expectStreamCast(exc, typeid(CUncastable).name(), typeid(Strings::string).name());
    }
}

class CThrowing {};

std::wostream& operator<<(std::wostream& stream, CThrowing const&) {
    throw std::runtime_error("operator");
    return stream;
}

TEST_F(CStdUtilStreamCastFailuresTest, WhatAnOperatorThrowsPasses) {
    EXPECT_THROW(stream_cast<Strings::string>(CThrowing()), std::runtime_error);
}

TEST_F(CStdUtilStreamCastFailuresTest, TheOriginIsTheCallers) {
    try {
        StdUtil::Detail::throwStreamCastError("/build/A", 7, "int f(int)", "Apr 29 2021",
                                              "08:35:23", "caf\xC3\xA9", "T");
    } catch (StdUtil::TExcStreamCast const& exc) {
        EXPECT_EQ(parametersOf(exc.getInfo().getMessage()),
                  (TParameters{{"source", L"caf\u00E9"}, {"target", L"T"}}));
        std::ostringstream stream;
        exc.writeTo(stream, true);
        EXPECT_EQ(stream.str(),
                  "'StreamCast': /build/A #  7, 'int f(int)()', (Apr 29 2021, 08:35:23): "
                  "[SevError] \"Could not cast 'caf\xC3\xA9' to 'T'\" ");
    }
}

} // namespace
