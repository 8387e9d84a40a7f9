#include "1Base/Strings/StringsMessage.h"

#include <utility>

namespace Strings {
namespace {

constexpr wchar_t escapeCharacter = L'@';
constexpr wchar_t openCharacter = L'(';
constexpr wchar_t closeCharacter = L')';

// Names are ASCII as a rule, and then a conversion would be most of an expansion's time.
template <class TText>
std::string narrowName(TText const& text, std::size_t begin, std::size_t end) {
    std::string narrow(end - begin, '\0');
    for (std::size_t i = begin; i < end; ++i) {
        if (static_cast<unsigned long>(text[i]) >= 0x80)
            return Encoding::convert<std::string>(text.substr(begin, end - begin));
        narrow[i - begin] = static_cast<char>(text[i]);
    }
    return narrow;
}

} // namespace

template <class TChar, class TParameterList>
void CMessage<TChar, TParameterList>::insertParameters(bool addLeftovers) const {
    TMap all;
    for (auto const& entry : parameters_)
        all.emplace(entry.getName(), entry.getValue());
    TMap remaining = all;
    doInsertParameters(text_, escapeCharacter, openCharacter, closeCharacter, all, remaining);
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
    TPosition position = findNextParameter_(text, escape, open, 0);
    while (position != TText::npos) {
        TPosition const mate = findMate_(text, open, close, position + 1);
        // What was inserted is scanned in its turn; what stays is left behind by its at sign, so
        // that a placeholder within its name is still found.
        bool const replaced =
            mate != TText::npos && replaceParameter_(text, position, mate, all, remaining);
        position = findNextParameter_(text, escape, open, replaced ? position : position + 1);
    }
}

template <class TChar, class TParameterList>
bool CMessage<TChar, TParameterList>::replaceParameter_(TText& text, TPosition position,
                                                        TPosition mate, TMap const& all,
                                                        TMap& remaining) const {
    std::string const name = narrowName(text, position + 2, mate);
    TPosition const length = mate - position + 1;
    // lower_bound, unlike find, gives the first of several equal names.
    auto const left = remaining.lower_bound(name);
    if (left != remaining.end() && left->first == name) {
        text.replace(position, length, left->second);
        remaining.erase(left);
        return true;
    }
    auto const used = all.lower_bound(name);
    if (used != all.end() && used->first == name) {
        text.replace(position, length, used->second);
        return true;
    }
    TText const offered = findMissingParamter(name);
    if (offered.empty())
        return false;
    text.replace(position, length, offered);
    return true;
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
