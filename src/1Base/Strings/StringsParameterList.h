/// Named values of a message as text.
///
///     Strings::CParameterList<wchar_t> list(Strings::buildNamedParameter("line", 7));
///     list.begin()->getValue();   // L"7"
#ifndef QORN_1BASE_STRINGSPARAMETERLIST_H
#define QORN_1BASE_STRINGSPARAMETERLIST_H

#include "1Base/StdUtil/StdUtilStreamCast.h"
#include "1Base/Strings/StringsParameter.h"
#include "1Base/TemplMeta/TemplMetaObjList.h"

#include <iterator>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace Strings {

/// Entries in the order of adding. Names are neither unique nor tested; an empty name or value is
/// legal; nothing is ever removed. A value becomes text through StdUtil::stream_cast at the moment
/// of adding, so later changes of it don't show. Adding raises what the cast raises, and the list
/// then keeps the entries that it had. An object belongs to one thread at a time.
template <class TChar>
class CParameterList {
  public:
    /// A name and its value as text, copied.
    class CEntry {
      public:
        /// Casts the value; raises what the cast raises.
        template <class T>
        CEntry(std::string const& name, T const& value)
            : value_(StdUtil::stream_cast<std::basic_string<TChar>, T>(value)), name_(name) {}

        /// @{
        /// Neither ever changes.
        std::string const& getName() const { return name_; }
        std::basic_string<TChar> const& getValue() const { return value_; }
        /// @}

        /// What a multimap of the entries holds.
        operator std::pair<std::string const, std::basic_string<TChar>>() const {
            return {name_, value_};
        }

      private:
        // In this order: where the cast raises, nothing has been copied.
        std::basic_string<TChar> value_;
        std::string name_;
    };

    /// Walks in the order of adding; adding ends its validity.
    using const_iterator = typename std::vector<CEntry>::const_iterator;

    CParameterList() = default;

    /// What a statement without parameters passes.
    CParameterList(TemplMeta::CNil) {}

    /// @{
    /// The values of a statement, as text from now on.
    template <class T>
    CParameterList(CStaticNamedParameter<T> const& parameter) {
        add(parameter);
    }

    template <class THead, class TTail>
    CParameterList(TemplMeta::CObjList<THead, TTail> const& list) {
        add(list);
    }
    /// @}

    /// The number of entries.
    std::size_t size() const { return entries_.size(); }

    /// @{
    /// The entries in the order of adding.
    const_iterator begin() const { return entries_.begin(); }
    const_iterator end() const { return entries_.end(); }
    /// @}

    /// Makes room for so many entries in all.
    void reserve(std::size_t count) { entries_.reserve(count); }

    /// @{
    /// Adds one entry; nothing for CNil.
    template <class T>
    void add(std::string const& name, T const& value) {
        entries_.emplace_back(name, value);
    }

    void add(CEntry const& entry) { entries_.push_back(entry); }

    template <class T>
    void add(CStaticNamedParameter<T> const& parameter) {
        add(std::string(parameter.getName()), parameter.getValue());
    }

    void add(TemplMeta::CNil) {}
    /// @}

    /// All elements in list order, with one growth at most.
    template <class THead, class TTail>
    void add(TemplMeta::CObjList<THead, TTail> const& list) {
        reserve(size() + TemplMeta::listSize(list));
        add_(list);
    }

    /// All entries of the other list, which may be this one.
    void add(CParameterList const& other) {
        std::size_t const count = other.size();
        reserve(size() + count);
        for (std::size_t i = 0; i < count; ++i)
            entries_.push_back(other.entries_[i]);
    }

    /// A range of entries, which may lie in this list.
    template <class TIterator,
              class TCategory = typename std::iterator_traits<TIterator>::iterator_category>
    std::enable_if_t<std::is_convertible_v<decltype(*std::declval<TIterator&>()), CEntry>>
    add(TIterator first, TIterator last) {
        add_(first, last, TCategory());
    }

  private:
    template <class THead, class TTail>
    void add_(TemplMeta::CObjList<THead, TTail> const& list) {
        add(list.head());
        add_(list.tail());
    }

    void add_(TemplMeta::CNil) {}

    template <class TIterator>
    void add_(TIterator first, TIterator last, std::input_iterator_tag) {
        for (; first != last; ++first)
            add(CEntry(*first));
    }

    template <class TIterator>
    void add_(TIterator first, TIterator last, std::forward_iterator_tag) {
        // Copied first, since growth would invalidate a range of this list.
        std::vector<CEntry> added(first, last);
        reserve(size() + added.size());
        std::move(added.begin(), added.end(), std::back_inserter(entries_));
    }

    std::vector<CEntry> entries_;
};

extern template class CParameterList<wchar_t>;

/// @{
/// The number of parameters in any of their forms.
template <class T>
constexpr std::size_t parameterCount(CStaticNamedParameter<T> const&) {
    return 1;
}

template <class THead, class TTail>
constexpr std::size_t parameterCount(TemplMeta::CObjList<THead, TTail> const& list) {
    return TemplMeta::listSize(list);
}

constexpr std::size_t parameterCount(TemplMeta::CNil) {
    return 0;
}

template <class TChar>
std::size_t parameterCount(CParameterList<TChar> const& list) {
    return list.size();
}
/// @}

/// A copy of the list with the parameter behind it.
template <class TChar, class T>
CParameterList<TChar> operator+(CParameterList<TChar> const& list,
                                CStaticNamedParameter<T> const& parameter) {
    CParameterList<TChar> result(list);
    result.add(parameter);
    return result;
}

} // namespace Strings

#endif
