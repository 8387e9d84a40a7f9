#include "1Base/Strings/StringsMessage.h"

#include "1Base/Error/ErrorMessage.h"

#include <algorithm>
#include <optional>
#include <typeinfo>
#include <utility>

namespace Strings {
namespace {

constexpr wchar_t escapeCharacter = L'@';
constexpr wchar_t openCharacter = L'(';
constexpr wchar_t closeCharacter = L')';

// A placeholder's name, while it stands in the text. It is ASCII as a rule, and is then compared as
// it stands: a conversion would be most of an expansion's time.
template <class TText>
class CName {
  public:
    CName(TText const& text, std::size_t begin, std::size_t end)
        : begin_(text.data() + begin), end_(text.data() + end) {
        if (!std::all_of(begin_, end_, isASCII))
            converted_ = Encoding::convert<std::string>(TText(begin_, end_));
    }

    bool is(std::string const& other) const {
        if (converted_)
            return *converted_ == other;
        return std::equal(begin_, end_, other.begin(), other.end(), [](TChar wide, char narrow) {
            return static_cast<char>(wide) == narrow;
        });
    }

    std::string narrow() const {
        if (converted_)
            return *converted_;
        std::string result(static_cast<std::size_t>(end_ - begin_), '\0');
        std::transform(begin_, end_, result.begin(),
                       [](TChar wide) { return static_cast<char>(wide); });
        return result;
    }

  private:
    using TChar = typename TText::value_type;

    static bool isASCII(TChar wide) { return static_cast<unsigned long>(wide) < 0x80; }

    TChar const* begin_;
    TChar const* end_;
    std::optional<std::string> converted_;
};

// What a run's placeholders take their values from. `replaceBy` puts a value in the place of the
// placeholder; only then is the entry used.
template <class TMap>
class CMapSource {
  public:
    CMapSource(TMap const& all, TMap& remaining) : all_(all), remaining_(remaining) {}

    template <class TName, class TReplace>
    bool use(TName const& placeholder, TReplace const& replaceBy) {
        std::string const name = placeholder.narrow();
        // lower_bound, unlike find, gives the first of several equal names.
        auto const left = remaining_.lower_bound(name);
        if (left != remaining_.end() && left->first == name) {
            replaceBy(left->second);
            remaining_.erase(left);
            return true;
        }
        auto const used = all_.lower_bound(name);
        if (used == all_.end() || used->first != name)
            return false;
        replaceBy(used->second);
        return true;
    }

  private:
    TMap const& all_;
    TMap& remaining_;
};

// The same without maps, for the few parameters that a message has as a rule.
template <class TParameterList>
class CListSource {
  public:
    static constexpr std::size_t most = 64;

    explicit CListSource(TParameterList const& list) : list_(list) {}

    template <class TName, class TReplace>
    bool use(TName const& name, TReplace const& replaceBy) {
        auto found = list_.end();
        for (auto entry = list_.begin(); entry != list_.end(); ++entry) {
            if (!name.is(entry->getName()))
                continue;
            if (!isUsed(entry)) {
                found = entry;
                break;
            }
            if (found == list_.end())
                found = entry;
        }
        if (found == list_.end())
            return false;
        replaceBy(found->getValue());
        used_ |= bit(found);
        return true;
    }

    template <class TMap>
    TMap remaining() const {
        TMap result;
        for (auto entry = list_.begin(); entry != list_.end(); ++entry) {
            if (!isUsed(entry))
                result.insert(*entry);
        }
        return result;
    }

  private:
    using TEntry = typename TParameterList::const_iterator;

    unsigned long long bit(TEntry entry) const { return 1ULL << (entry - list_.begin()); }
    bool isUsed(TEntry entry) const { return (used_ & bit(entry)) != 0; }

    TParameterList const& list_;
    unsigned long long used_ = 0;
};

// True for the classes that override nothing, so that nobody sees the maps of a run. Addresses are
// enough: a class that is described twice would only take the slower road.
template <class TMessage>
bool overridesNothing(TMessage const& message) {
    std::type_info const* const type = &typeid(message);
    return type == &typeid(Error::CMessage) || type == &typeid(TMessage) ||
           type == &typeid(Error::COSErrMessage);
}

} // namespace

template <class TChar, class TParameterList>
void CMessage<TChar, TParameterList>::insertParameters(bool addLeftovers) const {
    TMap remaining;
    if (parameters_.size() <= CListSource<TParameterList>::most && overridesNothing(*this)) {
        CListSource<TParameterList> source(parameters_);
        expand_(text_, escapeCharacter, openCharacter, closeCharacter, source);
        if (addLeftovers)
            remaining = source.template remaining<TMap>();
    } else {
        TMap all;
        for (auto const& entry : parameters_)
            all.insert(entry);
        remaining = all;
        doInsertParameters(text_, escapeCharacter, openCharacter, closeCharacter, all, remaining);
    }
    if (addLeftovers && !remaining.empty())
        addLeftoverPars_(text_, remaining);
}

template <class TChar, class TParameterList>
typename CMessage<TChar, TParameterList>::TText const&
CMessage<TChar, TParameterList>::getString(bool insert) const {
    if (insert)
        insertParameters(false);
    return text_;
}

template <class TChar, class TParameterList>
typename CMessage<TChar, TParameterList>::TText
CMessage<TChar, TParameterList>::findMissingParamter(std::string const&) const {
    return TText();
}

template <class TChar, class TParameterList>
void CMessage<TChar, TParameterList>::doInsertParameters(TText& text, TChar escape,
                                                         TChar const& open, TChar const& close,
                                                         TMap const& all, TMap& remaining) const {
    CMapSource<TMap> source(all, remaining);
    expand_(text, escape, open, close, source);
}

template <class TChar, class TParameterList>
template <class TSource>
void CMessage<TChar, TParameterList>::expand_(TText& text, TChar escape, TChar const& open,
                                              TChar const& close, TSource& source) const {
    TPosition position = findNextParameter_(text, escape, open, 0);
    while (position != TText::npos) {
        TPosition next = position + 1;
        TPosition const mate = findMate_(text, open, close, position + 1);
        if (mate != TText::npos) {
            auto const replaceBy = [&](TText const& value) {
                text.replace(position, mate - position + 1, value);
                // What was inserted is scanned in its turn; what stays is left behind by its at
                // sign, so that a placeholder within its name is still found.
                next = position;
            };
            CName<TText> const name(text, position + 2, mate);
            if (!source.use(name, replaceBy)) {
                TText const offered = findMissingParamter(name.narrow());
                if (!offered.empty())
                    replaceBy(offered);
            }
        }
        position = findNextParameter_(text, escape, open, next);
    }
}

// An escaped at sign collapses here, so it happens to each one that the search passes and to no
// other; the at sign that is left begins no placeholder in the same run.
template <class TChar, class TParameterList>
typename CMessage<TChar, TParameterList>::TPosition
CMessage<TChar, TParameterList>::findNextParameter_(TText& text, TChar escape, TChar open,
                                                    TPosition start) {
    TPosition position = text.find(escape, start);
    while (position != TText::npos) {
        if (position + 1 >= text.size())
            return TText::npos;
        if (text[position + 1] == open)
            return position;
        if (text[position + 1] == escape)
            text.erase(position, 1);
        position = text.find(escape, position + 1);
    }
    return TText::npos;
}

template <class TChar, class TParameterList>
typename CMessage<TChar, TParameterList>::TPosition
CMessage<TChar, TParameterList>::findMate_(TText const& text, TChar const& open, TChar const& close,
                                           TPosition position) {
    if (text[position] != open)
        return TText::npos;
    // A depth rather than a recursion: a text of nothing but open characters must not end the
    // stack. The close character is asked for first: the two may be the same.
    std::size_t depth = 1;
    while (++position < text.size()) {
        if (text[position] == close) {
            if (--depth == 0)
                return position;
        } else if (text[position] == open) {
            ++depth;
        }
    }
    return TText::npos;
}

template <class TChar, class TParameterList>
void CMessage<TChar, TParameterList>::addLeftoverPars_(TText& text, TMap& remaining) {
    if (remaining.empty())
        return;
    TText suffix = L" (";
    bool first = true;
    for (auto const& [name, value] : remaining) {
        if (!std::exchange(first, false))
            suffix += L", ";
        suffix += Encoding::convert<TText>(name);
        suffix += L": \"";
        suffix += value;
        suffix += L"\"";
    }
    remaining.clear();
    suffix += L")";
    text += suffix;
}

template class CMessage<wchar_t, CParameterList<wchar_t>>;

} // namespace Strings
