/// Message templates with named placeholders, and their expansion.
///
///     Strings::CParameterList<wchar_t> list;
///     list.add("key", L"/tmp/a");
///     Strings::CMessage<wchar_t, Strings::CParameterList<wchar_t>> message(
///         std::wstring(L"@(key) was not found"), list);
///     message.getString(true);   // L"/tmp/a was not found"
///
/// "@(name)" is a placeholder, "@@" an at sign, and every other "@" itself. Names may hold balanced
/// parentheses and are compared byte by byte. A placeholder that nothing answers stays as it is;
/// a value that no placeholder took can be appended. Nothing here is an error.
#ifndef QORN_1BASE_STRINGSMESSAGE_H
#define QORN_1BASE_STRINGSMESSAGE_H

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Strings/StringsParameterList.h"

#include <functional>
#include <map>
#include <ostream>
#include <string>
#include <utility>

namespace Strings {

/// A template text with its parameters.
///
/// Expansion rewrites the text in place, also of a const object: an object belongs to one thread at
/// a time. It is not idempotent. Each run starts from the text as the last one left it, with all
/// parameters: what one run made of "@@(name)" the next one fills in, and a second run that adds
/// leftovers lists the parameters that the first one used. A value is expanded in its turn; one
/// that leads back to itself never ends.
template <class TChar, class TParameterList>
class CMessage {
  public:
    /// The kind of its text and of its values.
    using TText = std::basic_string<TChar>;

    /// Values by their names, in the order of adding among equal ones.
    using TMap = std::multimap<std::string, TText, std::less<std::string>>;

    /// The text in any string kind, without parameters.
    template <class TC, class TT, class TA>
    explicit CMessage(std::basic_string<TC, TT, TA> const& text)
        : text_(Encoding::convert<TText>(text)) {}

    /// The text in any string kind, with its parameters.
    template <class TC, class TT, class TA>
    CMessage(std::basic_string<TC, TT, TA> const& text, TParameterList parameters)
        : text_(Encoding::convert<TText>(text)), parameters_(std::move(parameters)) {}

    CMessage(CMessage const&) = default;     ///< text and parameters as they stand
    CMessage(CMessage&&) noexcept = default; ///< the same, and the source is left unspecified
    CMessage& operator=(CMessage const&) = default;     ///< as the copy
    CMessage& operator=(CMessage&&) noexcept = default; ///< as the move

    virtual ~CMessage() = default;

    /// Adds a parameter, as CParameterList::add() does.
    template <class T>
    void add(std::string const& name, T const& value) {
        parameters_.add(name, value);
    }

    /// Adds all of the list.
    void add(TParameterList const& parameters) { parameters_.add(parameters); }

    /// Adds a range of entries.
    template <class TIterator,
              class TCategory = typename std::iterator_traits<TIterator>::iterator_category>
    std::enable_if_t<std::is_convertible_v<decltype(*std::declval<TIterator&>()),
                                           typename TParameterList::CEntry>>
    add(TIterator first, TIterator last) {
        parameters_.add(first, last);
    }

    auto begin() const { return parameters_.begin(); } ///< the parameters in the order of adding
    auto end() const { return parameters_.end(); }     ///< behind the last parameter

    /// Runs one expansion. With `addLeftovers` true the parameters that no placeholder of this run
    /// took are appended, sorted by name: ` (a: "1", b: "2")`. Raises the conversion failure for a
    /// name that is no text, and the text keeps what was done up to there.
    void insertParameters(bool addLeftovers) const;

    /// The text; with `insert` true after an expansion that adds no leftovers.
    TText const& getString(bool insert) const;

    /// The same in another string kind.
    template <class TString>
    TString getString(bool insert) const {
        return Encoding::convert<TString>(getString(insert));
    }

  protected:
    /// Answers a placeholder that no parameter does; an empty text leaves it as it stands.
    virtual TText findMissingParamter(std::string const& name) const;

    /// The expansion of `text`. `all` holds every parameter; what a placeholder takes is erased
    /// from `remaining`.
    virtual void doInsertParameters(TText& text, TChar escape, TChar const& open,
                                    TChar const& close, TMap const& all, TMap& remaining) const;

  private:
    using TPosition = typename TText::size_type;

    static TPosition findNextParameter_(TText& text, TChar escape, TChar open, TPosition start);
    static TPosition findMate_(TText const& text, TChar const& open, TChar const& close,
                               TPosition position);
    static void addLeftoverPars_(TText& text, TMap& remaining);

    template <class TSource>
    void expand_(TText& text, TChar escape, TChar const& open, TChar const& close,
                 TSource& source) const;

    mutable TText text_;
    TParameterList parameters_;
};

extern template class CMessage<wchar_t, CParameterList<wchar_t>>;

/// Writes the expanded text, converted to the stream's own string kind: a narrow stream gets UTF-8.
template <class TStreamChar, class TTraits, class TChar, class TParameterList>
std::basic_ostream<TStreamChar, TTraits>&
operator<<(std::basic_ostream<TStreamChar, TTraits>& stream,
           CMessage<TChar, TParameterList> const& message) {
    return stream << message.template getString<std::basic_string<TStreamChar>>(true);
}

} // namespace Strings

#endif
