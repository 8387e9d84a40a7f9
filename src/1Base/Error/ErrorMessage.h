/// Messages with numbered texts.
///
///     // Of the template "@(type) @(key) was not found":
///     Error::CMessage const message(Error::msgNotFound, params);
///     message.getString(true);   // L"File /tmp/a was not found"
#ifndef QORN_1BASE_ERRORMESSAGE_H
#define QORN_1BASE_ERRORMESSAGE_H

#include "1Base/Error/ErrorMessageIDs.h"
#include "1Base/Strings/StringsMessage.h"
#include "1Base/Strings/StringsParameterList.h"

#include <string>

namespace Error {

class CException;

/// A message that is built from a number and parameters. Its stream output is the one of
/// Strings::CMessage.
class CMessage : public Strings::CMessage<wchar_t, Strings::CParameterList<wchar_t>> {
  public:
    /// Puts other texts in the catalogue's place, for instance translated ones.
    class CMessageLoader {
      public:
        virtual ~CMessageLoader() = default;

        /// The text of doLoadMessage, or "<#20>?" (for id 20) where that is empty.
        Strings::string load(EMsgID const& id) const;

      protected:
        /// The text of `id`, with its placeholders; empty where there is none.
        virtual Strings::string doLoadMessage(EMsgID const& id) const = 0;
    };

    /// The text of `id`; an unknown one has the empty text, or what a loader makes of it.
    CMessage(EMsgID const& id, Strings::CParameterList<wchar_t> params);

    /// A narrow text (UTF-8) outside the catalogue, without parameters.
    template <class TT, class TA>
    explicit CMessage(std::basic_string<char, TT, TA> const& text) : TBase(text) {}

    /// The plain rendering of an exception as a fixed text, without parameters.
    explicit CMessage(CException const& exc);

    /// The text of `id` from the installed loader, which replaces the catalogue wholly, or from
    /// the catalogue.
    static Strings::string loadMessage(EMsgID const& id);

    /// Installs a loader, not owned, or none with null, and returns the one before. To be done
    /// before other threads use messages: the pointer is read without a lock.
    static CMessageLoader const* setMessageLoader(CMessageLoader const* loader);

  private:
    using TBase = Strings::CMessage<wchar_t, Strings::CParameterList<wchar_t>>;

    static CMessageLoader const* msgLoader_;
};

/// The message with the parameters added; the argument stays as it is.
CMessage operator+(CMessage const& message, Strings::CParameterList<wchar_t> const& params);

/// The catalogue's text of `id`, whatever loader is installed; empty where it has none.
Strings::string loadDefaultMessage(EMsgID const& id);

/// The text of an operating system error: always "unknown error". The code is accepted and not
/// looked at.
class COSErrMessage : public CMessage {
  public:
    /// @{
    /// Every code has the same text.
    COSErrMessage();
    explicit COSErrMessage(short code);
    /// @}
};

} // namespace Error

#endif
