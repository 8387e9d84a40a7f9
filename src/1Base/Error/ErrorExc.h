/// Exceptions declared by chains of tags.
///
///     namespace Demo {
///     TEMPLMETA_TAG_NAME(Parser);
///     using TExcParser = Error::TExc<TemplMeta::CTag<CTag_Name_Parser<char const*>>,
///                                    Error::CException>;
///     }
///     ERROR_THROW(Demo::TExcParser, Error::msgNotFound, params);   // throws XExc<TExcParser>
///     catch (Demo::TExcParser const& exc)                          // or any level above it
///
/// An exception is known to the registry from its construction to its destruction.
#ifndef QORN_1BASE_ERROREXC_H
#define QORN_1BASE_ERROREXC_H

#include "1Base/Error/ErrorExcRegistry.h"
#include "1Base/Error/ErrorException.h"
#include "1Base/Error/ErrorInfo.h"
#include "1Base/Strings/StringsParameterList.h"
#include "1Base/TemplMeta/TemplMetaTag.h"

namespace Error {

/// One level of a chain: a tag and up to five parents, each CException or another TExc. Every
/// parent is a virtual base, so that a chain may be a lattice and a catch at any level is never
/// ambiguous.
template <class TTag, class TParent1, class TParent2 = TemplMeta::CNil,
          class TParent3 = TemplMeta::CNil, class TParent4 = TemplMeta::CNil,
          class TParent5 = TemplMeta::CNil>
class TExc : public virtual TParent1,
             public virtual TParent2,
             public virtual TParent3,
             public virtual TParent4,
             public virtual TParent5 {
  public:
    /// The tag's name, a static text.
    char const* getExcName() const override { return TemplMeta::getTagName<TTag>(); }
};

/// A level with four parents.
template <class TTag, class TParent1, class TParent2, class TParent3, class TParent4>
class TExc<TTag, TParent1, TParent2, TParent3, TParent4, TemplMeta::CNil>
    : public virtual TParent1,
      public virtual TParent2,
      public virtual TParent3,
      public virtual TParent4 {
  public:
    /// The tag's name, a static text.
    char const* getExcName() const override { return TemplMeta::getTagName<TTag>(); }
};

/// A level with three parents.
template <class TTag, class TParent1, class TParent2, class TParent3>
class TExc<TTag, TParent1, TParent2, TParent3, TemplMeta::CNil, TemplMeta::CNil>
    : public virtual TParent1, public virtual TParent2, public virtual TParent3 {
  public:
    /// The tag's name, a static text.
    char const* getExcName() const override { return TemplMeta::getTagName<TTag>(); }
};

/// A level with two parents.
template <class TTag, class TParent1, class TParent2>
class TExc<TTag, TParent1, TParent2, TemplMeta::CNil, TemplMeta::CNil, TemplMeta::CNil>
    : public virtual TParent1, public virtual TParent2 {
  public:
    /// The tag's name, a static text.
    char const* getExcName() const override { return TemplMeta::getTagName<TTag>(); }
};

/// A level with one parent.
template <class TTag, class TParent1>
class TExc<TTag, TParent1, TemplMeta::CNil, TemplMeta::CNil, TemplMeta::CNil, TemplMeta::CNil>
    : public virtual TParent1 {
  public:
    /// The tag's name, a static text.
    char const* getExcName() const override { return TemplMeta::getTagName<TTag>(); }
};

/// The data of every exception.
class CExcImplementation : public virtual CException {
  public:
    /// Copies what the exception says; its trace is empty.
    explicit CExcImplementation(CInfo const& info) : info_(info) {}

    /// Origin, message and severity.
    CInfo const& getInfo() const override { return info_; }

    /// @{
    /// The guarded blocks passed so far.
    CStackInfoList const& getStackInfo() const override { return stackInfo_; }
    CStackInfoList& getStackInfo() override { return stackInfo_; }
    /// @}

    /// The one registry, alive before and behind every static object.
    static CExcRegistry* accessRegistry();

    /// The message of an exception that wraps `exc`: the inner text in double quotes, with the
    /// inner parameters to fill it.
    static CMessage buildExceptionMessage(CException const& exc);

  private:
    CInfo info_;
    CStackInfoList stackInfo_;
};

namespace Detail {

/// Joins a chain with the data, and tells the registry.
template <class TExc, class TImpl>
class CExcImplBase : public TExc, public TImpl {
  public:
    explicit CExcImplBase(CInfo const& info) : TImpl(info) { add_(info); }

    /// Wraps: the severity is the inner one's, the stack starts empty, and the registry is told
    /// what the inner exception says.
    CExcImplBase(COrigin const& origin, CException const& inner,
                 Strings::CParameterList<wchar_t> const& params)
        : TImpl(CInfo(origin, inner.getInfo().getSeverity(),
                      TImpl::buildExceptionMessage(inner) + params)) {
        add_(inner.getInfo());
    }

    /// A throw may copy; the copy is an exception of its own to the registry.
    CExcImplBase(CExcImplBase const& other) : CException(other), TExc(other), TImpl(other) {
        add_(this->getInfo());
    }

    CExcImplBase& operator=(CExcImplBase const&) = delete;

    ~CExcImplBase() override { TImpl::accessRegistry()->removeException_(this); }

  private:
    void add_(CInfo const& info) { TImpl::accessRegistry()->addException_(this, info); }
};

/// Adds a guarded block to the trace of the exception that is being handled, and goes on with it:
/// an exception of the family as the same object, a std::exception as one of the chains
/// StdLibException or BadAllocException, anything else unchanged. Never returns, and may only be
/// called in a handler.
[[noreturn]] void addStackTrace_(char const* file, unsigned int lineBegin, unsigned int lineEnd,
                                 char const* func, char const* date, char const* time);

} // namespace Detail

/// What is thrown. The first five arguments are the raising site's and static texts. The severity
/// is SevError, but for a wrapper, which has the one of what it wraps.
template <class TExc>
class XExc : public Detail::CExcImplBase<TExc, CExcImplementation> {
  public:
    /// The catalogue's text.
    XExc(char const* file, unsigned int line, char const* func, char const* date, char const* time,
         EMsgID const& id)
        : XExc(file, line, func, date, time, id, TemplMeta::CNil()) {}

    /// The catalogue's text with parameters in any of their forms.
    template <class TParams>
    XExc(char const* file, unsigned int line, char const* func, char const* date, char const* time,
         EMsgID const& id, TParams const& params)
        : XExc(file, line, func, date, time,
               CMessage(id, Strings::CParameterList<wchar_t>(params))) {}

    /// A message with further parameters behind its own.
    XExc(char const* file, unsigned int line, char const* func, char const* date, char const* time,
         CMessage const& message, Strings::CParameterList<wchar_t> const& params)
        : XExc(file, line, func, date, time, message + params) {}

    /// A message as it is.
    XExc(char const* file, unsigned int line, char const* func, char const* date, char const* time,
         CMessage const& message)
        : TBase(CInfo(file, line, func, date, time, SevError, message)) {}

    /// Wraps an exception in another chain. Its trace is not taken over.
    XExc(char const* file, unsigned int line, char const* func, char const* date, char const* time,
         CException const& inner)
        : TBase(COrigin(file, line, func, date, time), inner, Strings::CParameterList<wchar_t>()) {}

    /// A throw may copy; the copy is an exception of its own to the registry.
    XExc(XExc const& other) : CException(other), TBase(other) {}

    XExc& operator=(XExc const&) = delete;

  private:
    using TBase = Detail::CExcImplBase<TExc, CExcImplementation>;
};

} // namespace Error

#endif
