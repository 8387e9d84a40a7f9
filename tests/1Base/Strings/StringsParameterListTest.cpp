#include "1Base/Strings/StringsParameterList.h"

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Error/ErrorMacros.h"

#include "support/AllocationCount.h"
#include "support/ObjectCount.h"

#include <iterator>
#include <map>
#include <ostream>
#include <sstream>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using Strings::buildNamedParameter;
using TList = Strings::CParameterList<wchar_t>;
using TEntry = TList::CEntry;
using TestSupport::allocationsMade;
using TestSupport::bytesAllocated;

// One line an entry, so that a failure shows whole lists.
std::wstring describe(TList const& list) {
    std::wstring text;
    for (TEntry const& entry : list)
        text += std::wstring(entry.getName().begin(), entry.getName().end()) + L"=" +
                entry.getValue() + L"\n";
    return text;
}

template <class T>
std::wstring valueOf(T const& value) {
    TList list;
    list.add("name", value);
    return list.begin()->getValue();
}

TList namedFrom(std::initializer_list<std::pair<char const*, wchar_t const*>> entries) {
    TList list;
    for (auto const& [name, value] : entries)
        list.add(name, value);
    return list;
}

class CStringsParameterListTest : public TestSupport::CObjectCountTest {};

// The stage of the statement costs two pointers, and nothing is made of them before they are text.
using TIntParameter = Strings::CStaticNamedParameter<int>;
static_assert(sizeof(TIntParameter) == 2 * sizeof(void*));
static_assert(std::is_trivially_copyable_v<TIntParameter>);
static_assert(std::is_same_v<decltype(buildNamedParameter("a", "text")),
                             Strings::CStaticNamedParameter<char[5]>>);
static_assert(std::is_same_v<decltype(Error::buildNamedParameter("a", 1)), TIntParameter>);

constexpr int fixedValue = 7;
constexpr TIntParameter fixedParameter = buildNamedParameter("seven", fixedValue);
static_assert(fixedParameter.getValue() == 7 && fixedParameter.getName()[0] == 's');
static_assert(TemplMeta::listSize(fixedParameter + fixedParameter + fixedParameter) == 3);
static_assert(sizeof(fixedParameter + fixedParameter + fixedParameter) == 6 * sizeof(void*));

static_assert(std::is_copy_constructible_v<TList> && std::is_copy_assignable_v<TList>);
static_assert(std::is_nothrow_move_constructible_v<TList> && std::is_move_assignable_v<TList>);
static_assert(std::is_copy_constructible_v<TEntry> && std::is_copy_assignable_v<TEntry>);
static_assert(std::is_nothrow_move_constructible_v<TEntry> && std::is_move_assignable_v<TEntry>);

TEST_F(CStringsParameterListTest, AnEmptyListHasNoEntries) {
    TList const none;
    TList const nil{TemplMeta::CNil()};
    EXPECT_EQ(none.size(), 0U);
    EXPECT_EQ(nil.size(), 0U);
    EXPECT_EQ(nil.begin(), nil.end());
}

TEST_F(CStringsParameterListTest, AStatementPassesEachOfItsFormsSilently) {
    auto const count = [](TList const& list) { return list.size(); };
    EXPECT_EQ(count(TemplMeta::CNil()), 0U);
    EXPECT_EQ(count(buildNamedParameter("a", 1)), 1U);
    EXPECT_EQ(count(buildNamedParameter("a", 1) + buildNamedParameter("b", 2)), 2U);
    EXPECT_EQ(count(TList()), 0U);
}

TEST_F(CStringsParameterListTest, ASumOfThreeComesOutThirdFirstSecond) {
    int const values[] = {1, 2, 3, 4};
    auto const a = buildNamedParameter("a", values[0]);
    auto const b = buildNamedParameter("b", values[1]);
    auto const c = buildNamedParameter("c", values[2]);
    auto const d = buildNamedParameter("d", values[3]);
    EXPECT_EQ(describe(a + b), L"a=1\nb=2\n");
    EXPECT_EQ(describe(a + b + c), L"c=3\na=1\nb=2\n");
    EXPECT_EQ(describe(a + b + c + d), L"d=4\nc=3\na=1\nb=2\n");
    EXPECT_EQ(describe(a + (b + c)), L"a=1\nb=2\nc=3\n");
}

TEST_F(CStringsParameterListTest, AListWithAParameterOnTheRightIsANewListThatEndsInIt) {
    TList const list = namedFrom({{"b", L"2"}, {"a", L"1"}});
    TList const longer = list + buildNamedParameter("aa", 3) + buildNamedParameter("a", 4);
    EXPECT_EQ(describe(list), L"b=2\na=1\n");
    EXPECT_EQ(describe(longer), L"b=2\na=1\naa=3\na=4\n");
}

TEST_F(CStringsParameterListTest, ParametersInOrderComeOutAsTheyAreWritten) {
    int const type = 1;
    int const key = 2;
    int const reason = 3;
    EXPECT_EQ(describe(ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key), ERROR_PARAM(reason))),
              L"type=1\nkey=2\nreason=3\n");
    EXPECT_EQ(describe(ERROR_PARAMS(ERROR_PARAM(type))), L"type=1\n");
    EXPECT_EQ(describe(ERROR_PARAMS()), L"");
}

TEST_F(CStringsParameterListTest, AParameterIsNamedByTheTextOfItsExpression) {
    std::pair<int, int> const pair(1, 2);
    void const* const pointer = nullptr;
    TList const list = ERROR_PARAMS(ERROR_PARAM(pair.first + 1), ERROR_PARAM(pointer == NULL),
                                    ERROR_PARAM(std::pair<int, int>(3, 4).second));
    EXPECT_EQ(describe(list), L"pair.first + 1=2\n"
                              L"pointer == NULL=1\n"
                              L"std::pair<int, int>(3, 4).second=4\n");
}

TEST_F(CStringsParameterListTest, NamesAndValuesAreNeitherTestedNorMerged) {
    EXPECT_EQ(describe(namedFrom({{"b", L"1"}, {"a", L""}, {"b", L"2"}, {"", L""}, {"b", L"1"}})),
              L"b=1\na=\nb=2\n=\nb=1\n");
}

TEST_F(CStringsParameterListTest, ANameMayHoldAnyBytes) {
    TList list;
    list.add(std::string("a\0b\xFF", 4), 1);
    EXPECT_EQ(list.begin()->getName(), std::string("a\0b\xFF", 4));
}

TEST_F(CStringsParameterListTest, AnEntryIsASnapshotOfItsValue) {
    int number = 1;
    std::string text = "before";
    std::string name = "n";
    auto const parameters =
        buildNamedParameter("number", number) + buildNamedParameter("text", text);
    number = 2;
    TList list(parameters);
    list.add(name, text);
    number = 3;
    text = "after";
    name = "m";
    EXPECT_EQ(describe(list), L"number=2\ntext=before\nn=before\n");
}

TEST_F(CStringsParameterListTest, CopiesAreIndependent) {
    TList list = namedFrom({{"a", L"1"}});
    TList copy(list);
    copy.add("b", 2);
    list.add("c", 3);
    EXPECT_EQ(describe(list), L"a=1\nc=3\n");
    EXPECT_EQ(describe(copy), L"a=1\nb=2\n");
    list = copy;
    copy.add("d", 4);
    EXPECT_EQ(describe(list), L"a=1\nb=2\n");
    TList const moved(std::move(copy));
    EXPECT_EQ(describe(moved), L"a=1\nb=2\nd=4\n");
}

// Adding.

TEST_F(CStringsParameterListTest, AListMayBeAddedToItself) {
    TList list = namedFrom({{"a", L"1"}, {"b", L"2"}});
    list.add(list);
    EXPECT_EQ(describe(list), L"a=1\nb=2\na=1\nb=2\n");
}

TEST_F(CStringsParameterListTest, ARangeOfAListMayBeAddedToItself) {
    TList list = namedFrom({{"a", L"1"}, {"b", L"2"}, {"c", L"a longer text"}});
    list.add(list.begin() + 1, list.end());
    EXPECT_EQ(describe(list), L"a=1\nb=2\nc=a longer text\nb=2\nc=a longer text\n");
    list.add(*list.begin());
    EXPECT_EQ(list.size(), 6U);
    EXPECT_EQ((list.end() - 1)->getName(), "a");
    list.add(list.begin(), list.begin());
    EXPECT_EQ(list.size(), 6U);
}

TEST_F(CStringsParameterListTest, AnEntryMayBeAddedUnderItsOwnNameAndValue) {
    TList list = namedFrom({{"a", L"a longer text"}});
    for (int i = 0; i < 20; ++i)
        list.add(list.begin()->getName(), list.begin()->getValue());
    ASSERT_EQ(list.size(), 21U);
    for (TEntry const& entry : list) {
        EXPECT_EQ(entry.getName(), "a");
        EXPECT_EQ(entry.getValue(), L"a longer text");
    }
}

TEST_F(CStringsParameterListTest, EntriesOfOtherContainersAreAdded) {
    std::vector<TEntry> const entries = {TEntry("a", 1), TEntry("b", 2)};
    TList list;
    list.add(entries.begin(), entries.end());
    list.add(entries.data(), entries.data() + 1);
    EXPECT_EQ(describe(list), L"a=1\nb=2\na=1\n");
}

// A range that can be walked only once.
class COnceIterator {
  public:
    using iterator_category = std::input_iterator_tag;
    using value_type = TEntry;
    using difference_type = std::ptrdiff_t;
    using pointer = TEntry const*;
    using reference = TEntry;

    COnceIterator(std::wistream* stream, wchar_t value) : stream_(stream), value_(value) {}

    TEntry operator*() const { return TEntry("digit", value_); }
    COnceIterator& operator++() {
        *stream_ >> value_;
        return *this;
    }
    bool operator!=(COnceIterator const& other) const { return value_ != other.value_; }

  private:
    std::wistream* stream_;
    wchar_t value_;
};

TEST_F(CStringsParameterListTest, ARangeThatCanBeReadOnceIsReadOnce) {
    std::wistringstream stream(L"23.");
    TList list;
    list.add(COnceIterator(&stream, L'1'), COnceIterator(nullptr, L'.'));
    EXPECT_EQ(describe(list), L"digit=1\ndigit=2\ndigit=3\n");
}

TEST_F(CStringsParameterListTest, TwoTextsAreANameAndAValue) {
    char const* const name = "a";
    char const* const value = "b";
    TList list;
    list.add("a", "b");
    list.add(name, value);
    EXPECT_EQ(describe(list), L"a=b\na=b\n");
}

TEST_F(CStringsParameterListTest, ParametersAndListsOfThemAreAdded) {
    TList list;
    list.add(buildNamedParameter("a", 1));
    list.add(buildNamedParameter("b", 2) + buildNamedParameter("c", 3));
    list.add(namedFrom({{"d", L"4"}}));
    EXPECT_EQ(describe(list), L"a=1\nb=2\nc=3\nd=4\n");
}

// Allocations. Names and values are short enough to lie within their strings.

TEST_F(CStringsParameterListTest, AStatementGathersItsParametersWithoutAllocation) {
    std::wstring const value = L"x";
    std::size_t const before = allocationsMade();
    auto const a = buildNamedParameter("a", value);
    auto const sum = a + a + a + a + a + a;
    auto const inOrder = Error::inOrder(a, a, a, a, a, a);
    EXPECT_EQ(allocationsMade(), before);
    EXPECT_EQ(TemplMeta::listSize(sum) + TemplMeta::listSize(inOrder), 12U);
}

TEST_F(CStringsParameterListTest, AListOfParametersCostsOneGrowth) {
    std::wstring const value = L"x";
    auto const a = buildNamedParameter("a", value);
    auto const five = a + a + a + a + a;

    std::size_t before = allocationsMade();
    TList list(five);
    EXPECT_EQ(allocationsMade(), before + 1);
    EXPECT_EQ(list.size(), 5U);

    before = allocationsMade();
    list.add(five);
    EXPECT_EQ(allocationsMade(), before + 1);

    list.reserve(100);
    before = allocationsMade();
    list.add(five);
    list.add(list);
    EXPECT_EQ(allocationsMade(), before);
    EXPECT_EQ(list.size(), 30U);
}

// Failures.

struct CRaising {};

std::wostream& operator<<(std::wostream&, CRaising const&) {
    throw std::runtime_error("no text");
}

TEST_F(CStringsParameterListTest, AValueThatRaisesLeavesTheListAsItWas) {
    TList list = namedFrom({{"a", L"1"}});
    EXPECT_THROW(list.add("b", CRaising()), std::runtime_error);
    EXPECT_THROW(list.add(buildNamedParameter("b", CRaising())), std::runtime_error);
    EXPECT_EQ(describe(list), L"a=1\n");
    EXPECT_THROW(TList(buildNamedParameter("b", CRaising())), std::runtime_error);
}

TEST_F(CStringsParameterListTest, WhatStoodBeforeAFailingParameterStays) {
    TList list = namedFrom({{"a", L"1"}});
    EXPECT_THROW(
        list.add(Error::inOrder(buildNamedParameter("b", 2), buildNamedParameter("c", CRaising()),
                                buildNamedParameter("d", 4))),
        std::runtime_error);
    EXPECT_EQ(describe(list), L"a=1\nb=2\n");
}

TEST_F(CStringsParameterListTest, ANarrowValueThatIsNoTextRaisesTheConversionFailure) {
    TList list;
    EXPECT_THROW(list.add("a", std::string("\xFF")), Encoding::TExcEncoding);
    EXPECT_EQ(list.size(), 0U);
}

// Tells how much had been allocated when it was written.
struct CWitness {
    std::size_t* bytes;
};

std::wostream& operator<<(std::wostream& stream, CWitness const& witness) {
    *witness.bytes = bytesAllocated();
    return stream;
}

TEST_F(CStringsParameterListTest, TheValueIsCastBeforeTheNameIsCopied) {
    std::string const name(100000, 'n');
    std::size_t before = bytesAllocated();
    std::size_t atTheCast = 0;
    TEntry const entry(name, CWitness{&atTheCast});
    EXPECT_LT(atTheCast - before, name.size());
    EXPECT_GE(bytesAllocated() - before, name.size());
    EXPECT_EQ(entry.getName(), name);

    before = bytesAllocated();
    EXPECT_THROW(TEntry(name, CRaising()), std::runtime_error);
    EXPECT_LT(bytesAllocated() - before, name.size());
}

// Kinds of value.

enum EPlain { epSeven = 7 };
enum ESpeaking { esOne = 1 };

std::wostream& operator<<(std::wostream& stream, ESpeaking const&) {
    return stream << L"one";
}

// An address that nobody should ask for by the operator.
class CAddressless {
  public:
    CAddressless* operator&() = delete;
    CAddressless const* operator&() const = delete;
};

std::wostream& operator<<(std::wostream& stream, CAddressless const&) {
    return stream << L"addressless";
}

TEST_F(CStringsParameterListTest, NumbersAreWrittenInTheStreamsDefaultForm) {
    EXPECT_EQ(valueOf(-12345), L"-12345");
    EXPECT_EQ(valueOf(0U), L"0");
    EXPECT_EQ(valueOf(static_cast<unsigned short>(65535)), L"65535");
    EXPECT_EQ(valueOf(static_cast<unsigned char>('A')), L"65");
    EXPECT_EQ(valueOf(2147483648L), L"2147483648");
    EXPECT_EQ(valueOf(true), L"1");
    EXPECT_EQ(valueOf(false), L"0");
}

TEST_F(CStringsParameterListTest, CharactersAreWrittenAsCharacters) {
    EXPECT_EQ(valueOf('x'), L"x");
    EXPECT_EQ(valueOf(L'\u00E9'), L"\u00E9");
}

TEST_F(CStringsParameterListTest, NarrowTextsAreDecoded) {
    std::string const text = "caf\xC3\xA9";
    EXPECT_EQ(valueOf(text), L"caf\u00E9");
    EXPECT_EQ(valueOf(text.c_str()), L"caf\u00E9");
    EXPECT_EQ(valueOf(std::string()), L"");
}

TEST_F(CStringsParameterListTest, WideTextsAreTaken) {
    std::wstring const text = L"caf\u00E9 \U0001F600";
    EXPECT_EQ(valueOf(text), text);
    EXPECT_EQ(valueOf(text.c_str()), text);
    EXPECT_EQ(valueOf(std::wstring(L"a\0b", 3)), std::wstring(L"a\0b", 3));
}

TEST_F(CStringsParameterListTest, AnArrayEndsAtItsFirstZero) {
    char const buffer[16] = "abc";
    EXPECT_EQ(valueOf("abc"), L"abc");
    EXPECT_EQ(valueOf(buffer), L"abc");
    EXPECT_EQ(valueOf(""), L"");
    EXPECT_EQ(describe(buildNamedParameter("buffer", buffer)), L"buffer=abc\n");
}

TEST_F(CStringsParameterListTest, AnEnumerationIsItsNumberUnlessItHasAnOperatorOfItsOwn) {
    EXPECT_EQ(valueOf(epSeven), L"7");
    EXPECT_EQ(valueOf(esOne), L"one");
    EXPECT_EQ(valueOf(Error::msgCastFailed), L"20");
}

TEST_F(CStringsParameterListTest, AnObjectWritesItself) {
    EXPECT_EQ(valueOf(Error::COSErrMessage(5)), L"unknown error");
}

TEST_F(CStringsParameterListTest, TheAddressOfAValueIsTakenBehindItsOperators) {
    CAddressless const value{};
    EXPECT_EQ(std::addressof(buildNamedParameter("a", value).getValue()), std::addressof(value));
    EXPECT_EQ(describe(buildNamedParameter("a", value)), L"a=addressless\n");
}

TEST_F(CStringsParameterListTest, AnEntryIsAPairOfNameAndValue) {
    TList const list = namedFrom({{"b", L"2"}, {"a", L"1"}});
    std::pair<std::string const, std::wstring> const pair = *list.begin();
    EXPECT_EQ(pair.first, "b");
    EXPECT_EQ(pair.second, L"2");
    std::multimap<std::string, std::wstring> const map(list.begin(), list.end());
    EXPECT_EQ(map.begin()->first, "a");
    EXPECT_EQ(map.size(), 2U);
}

} // namespace
