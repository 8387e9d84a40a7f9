/// The forms in which code raises, guards, asserts and logs. They supply what a function can't
/// know by itself: the place in the sources, and the text of an expression. All but the guarded
/// block and the origin are expressions, also within templates and within other macros' arguments.
#ifndef QORN_1BASE_ERRORMACROS_H
#define QORN_1BASE_ERRORMACROS_H

#include "1Base/Error/ErrorAssert.h"
#include "1Base/Error/ErrorExc.h"
#include "1Base/Error/ErrorExcChains.h"
#include "1Base/Error/ErrorLogging.h"
#include "1Base/Error/ErrorParameter.h"

/// File, line, signature, build date and build time: five arguments.
#define ERROR_ORIGIN __FILE__, __LINE__, __PRETTY_FUNCTION__, __DATE__, __TIME__

/// A named parameter whose name is the expression's text and whose value is its value.
///
///     ERROR_PARAM(fs.getFullName(false))
#define ERROR_PARAM(...) ::Error::buildNamedParameter(#__VA_ARGS__, (__VA_ARGS__))

/// Parameters in the order in which they are written, or none; a sum of them would permute them.
///
///     ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key))
#define ERROR_PARAMS(...) ::Error::inOrder(__VA_ARGS__)

/// Raises an exception of the chain TExcX: with a catalogue text and parameters or none, with a
/// message, or as a wrapper of another exception.
///
///     ERROR_THROW(TExcFileSpec, Error::msgNotFound,
///                 ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key)));
#define ERROR_THROW(TExcX, ...) throw ::Error::XExc<TExcX>(ERROR_ORIGIN, __VA_ARGS__)

/// A guarded block. What leaves it has gained an entry in its trace, and a std::exception has
/// become one of the family.
///
///     ERROR_BLOCK_BEGIN
///         remove(path);
///     ERROR_BLOCK_END
///
/// The handler for the family saves what the catch-all would cost it, a second rethrow.
#define ERROR_BLOCK_BEGIN                                                                          \
    {                                                                                              \
        ERROR_IGNORE_SHADOW_BEGIN_                                                                 \
        constexpr unsigned int errorBlockBegin_ = __LINE__;                                        \
        ERROR_IGNORE_SHADOW_END_                                                                   \
        try {

/// Ends a guarded block. Its line is the last one in the entry of the trace.
#define ERROR_BLOCK_END                                                                            \
    }                                                                                              \
    catch (::Error::CExcImplementation & errorException_) {                                        \
        errorException_.getStackInfo().add(::Error::CStackInfo(                                    \
            __FILE__, errorBlockBegin_, __LINE__, __PRETTY_FUNCTION__, __DATE__, __TIME__));       \
        throw;                                                                                     \
    }                                                                                              \
    catch (...) {                                                                                  \
        ::Error::Detail::addStackTrace_(__FILE__, errorBlockBegin_, __LINE__, __PRETTY_FUNCTION__, \
                                        __DATE__, __TIME__);                                       \
    }                                                                                              \
    }

/// Asserts an expression and hands its value back. A failure is reported and raised; the text is
/// the expression's, with its macros expanded.
#define ERROR_ASSERT(...) ERROR_ASSERT_TEXT((__VA_ARGS__), ERROR_TEXT_(__VA_ARGS__))

/// The same with one named parameter, or a list of parameters, for the report.
///
///     ERROR_ASSERT_P(ERROR_PARAM(n), n > 0);
#define ERROR_ASSERT_P(param, ...)                                                                 \
    (::Error::Detail::CAsserter_<true, true>::do_assert(ERROR_ORIGIN, (__VA_ARGS__),               \
                                                        ERROR_TEXT_(__VA_ARGS__), param))

/// The same with a text of its own for the expression.
#define ERROR_ASSERT_TEXT(value, text)                                                             \
    (::Error::Detail::CAsserter_<true, true>::do_assert(ERROR_ORIGIN, value, text,                 \
                                                        ::Error::Detail::CAssertDummy()))

/// Logs a text, char const* or wchar_t const*, with parameters of any form or none.
///
///     ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug, "copying @(key)",
///               ERROR_PARAM(key));
#define ERROR_LOG(TLogger, TTarget, TSeverity, ...)                                                \
    (TLogger::template log<TTarget, TSeverity>(ERROR_ORIGIN, __VA_ARGS__))

/// An expression as text, its macros expanded.
#define ERROR_TEXT_(...) #__VA_ARGS__

/// Keeps compilers from warning of nested guarded blocks, whose variables have one name.
#define ERROR_IGNORE_SHADOW_BEGIN_                                                                 \
    _Pragma("GCC diagnostic push") _Pragma("GCC diagnostic ignored \"-Wshadow\"")
/// The end of what ERROR_IGNORE_SHADOW_BEGIN_ began.
#define ERROR_IGNORE_SHADOW_END_ _Pragma("GCC diagnostic pop")

#endif
