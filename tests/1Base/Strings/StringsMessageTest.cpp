#include "1Base/Strings/StringsMessage.h"

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Strings/StringsMessageProbe.h"
#include "support/ObjectCount.h"

#include <initializer_list>
#include <sstream>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using TestSupport::CMessageProbe;
using TestSupport::TLeftovers;
using TestSupport::TMessage;
using TestSupport::TParameters;

using TEntries = std::initializer_list<std::pair<char const*, wchar_t const*>>;

TParameters parameters(TEntries entries) {
    TParameters list;
    for (auto const& [name, value] : entries)
        list.add(name, value);
    return list;
}

TParameters const& oneAndTwo() {
    static TParameters const list = parameters({{"a", L"1"}, {"b", L"2"}});
    return list;
}

std::wstring expand(std::wstring const& text, TParameters const& list) {
    return TMessage(text, list).getString(true);
}

std::wstring expandAll(std::wstring const& text, TParameters const& list) {
    TMessage const message(text, list);
    message.insertParameters(true);
    return message.getString(false);
}

TLeftovers leftoversOf(std::wstring const& text, TParameters const& list) {
    CMessageProbe const message(text, list);
    message.insertParameters(false);
    return message.leftovers();
}

class CStringsMessageTest : public TestSupport::CObjectCountTest {};

static_assert(std::is_polymorphic_v<TMessage> && std::has_virtual_destructor_v<TMessage>);
static_assert(std::is_copy_constructible_v<TMessage>);
static_assert(std::is_same_v<TMessage::TMap,
                             std::multimap<std::string, std::wstring, std::less<std::string>>>);

// The language. a = 1 and b = 2 unless a test says otherwise.

struct CRow {
    wchar_t const* text;
    wchar_t const* result;
    TLeftovers leftovers;
};

TLeftovers const none;
TLeftovers const onlyA = {{"a", L"1"}};
TLeftovers const onlyB = {{"b", L"2"}};
TLeftovers const both = {{"a", L"1"}, {"b", L"2"}};

CRow const rows[] = {
    {L"", L"", both},
    {L"plain", L"plain", both},
    {L"x@(a)y", L"x1y", onlyB},
    {L"@(a)@(a)", L"11", onlyB},
    {L"@(b)@(a)", L"21", none},
    {L"@(b)", L"2", onlyA},
    // Names that nothing answers.
    {L"@(z)", L"@(z)", both},
    {L"@()", L"@()", both},
    {L"@( a )", L"@( a )", both},
    {L"@(A)", L"@(A)", both},
    {L"@(ab)", L"@(ab)", both},
    {L"@(z)@(a)@(z)", L"@(z)1@(z)", onlyB},
    // Parentheses without their mate.
    {L"@(a", L"@(a", both},
    {L"@(", L"@(", both},
    {L"@)a(", L"@)a(", both},
    {L"@(a))", L"1)", onlyB},
    {L"(@(a))", L"(1)", onlyB},
    {L"@(z @(a)", L"@(z 1", onlyB},
    {L"@(a(@(b)", L"@(a(2", onlyA},
    {L"@((a)", L"@((a)", both},
    // A placeholder within the name of an unknown one.
    {L"@(z@(a))", L"@(z1)", onlyB},
    {L"@(z@(y@(a))@(b))", L"@(z@(y1)2)", none},
    {L"@(@(a))", L"@(1)", onlyB},
    // At signs.
    {L"@@(a)", L"@(a)", both},
    {L"@@@(a)", L"@1", onlyB},
    {L"@@@@(a)", L"@@(a)", both},
    {L"@@@@@(a)", L"@@1", onlyB},
    {L"50@ and @", L"50@ and @", both},
    {L"x@@", L"x@", both},
    {L"@", L"@", both},
    {L"@@", L"@", both},
    {L"@@@", L"@@", both},
    {L"@@@@", L"@@", both},
    {L"@ (a)", L"@ (a)", both},
    {L"@a@@b@", L"@a@b@", both},
    {L"@(z@@y)", L"@(z@y)", both},
    {L"@@)@(a)@@(", L"@)1@(", onlyB},
};

TEST_F(CStringsMessageTest, EachConstructMeansWhatTheTableSays) {
    for (CRow const& row : rows) {
        SCOPED_TRACE(testing::PrintToString(std::wstring(row.text)));
        CMessageProbe const message(std::wstring(row.text), oneAndTwo());
        EXPECT_EQ(message.getString(true), row.result);
        EXPECT_EQ(message.leftovers(), row.leftovers);
        // A class that overrides nothing takes a shorter road.
        EXPECT_EQ(expand(row.text, oneAndTwo()), row.result);
    }
}

TEST_F(CStringsMessageTest, AnEmptyNameIsANameLikeAnyOther) {
    TParameters const list = parameters({{"", L"empty"}});
    EXPECT_EQ(expand(L"@() @( )", list), L"empty @( )");
    EXPECT_EQ(leftoversOf(L"@()", list), none);
}

TEST_F(CStringsMessageTest, ANameMayHoldBalancedParentheses) {
    TParameters const list = parameters({{"f(x)", L"1"}, {"(a)(b)", L"2"}, {"((", L"3"}});
    EXPECT_EQ(expand(L"@(f(x))", list), L"1");
    EXPECT_EQ(expand(L"@((a)(b))", list), L"2");
    EXPECT_EQ(expand(L"@((()", list), L"@((()");
    EXPECT_EQ(expand(L"@(f(x)) f(x)", list), L"1 f(x)");
}

TEST_F(CStringsMessageTest, AMillionParenthesesDoNotEndTheStack) {
    std::size_t const depth = 1000000;
    TParameters list;
    list.add(std::string(depth, '(') + std::string(depth, ')'), L"deep");
    EXPECT_EQ(expand(L"@(" + std::wstring(depth, L'(') + std::wstring(depth + 1, L')'), list),
              L"deep");
    std::wstring const open = L"@" + std::wstring(depth, L'(');
    EXPECT_EQ(expand(open, list), open);
}

// Names.

TEST_F(CStringsMessageTest, NamesAreComparedByTheirBytes) {
    TParameters const list = parameters({{"gr\xC3\xB6\xC3\x9F"
                                          "e",
                                          L"\u00FC"},
                                         {"\xF0\x9F\x98\x80", L"\U0001F601"}});
    EXPECT_EQ(expand(L"@(gr\u00F6\u00DFe)", list), L"\u00FC");
    EXPECT_EQ(expand(L"@(\U0001F600)", list), L"\U0001F601");
    // The same letter in two parts is another name, and so is another case.
    EXPECT_EQ(expand(L"@(gro\u0308\u00DFe)", list), L"@(gro\u0308\u00DFe)");
    EXPECT_EQ(expand(L"@(GR\u00D6\u00DFE)", list), L"@(GR\u00D6\u00DFE)");
}

TEST_F(CStringsMessageTest, AZeroIsACharacterLikeAnyOther) {
    TParameters list;
    list.add(std::string("a\0b", 3), std::wstring(L"x\0y", 3));
    EXPECT_EQ(expand(std::wstring(L"\0@(a\0b)\0", 8), list), std::wstring(L"\0x\0y\0", 5));
    EXPECT_EQ(expand(L"@(a)", list), L"@(a)");
}

TEST_F(CStringsMessageTest, ANameThatIsNoTextRaisesAndWhatWasDoneStays) {
    for (int const element : {0xD800, 0xDFFF, 0x110000, -1}) {
        std::wstring const name(1, static_cast<wchar_t>(element));
        TMessage const message(L"@@ @(a) @(" + name + L") @(b)", oneAndTwo());
        EXPECT_THROW(message.insertParameters(true), Encoding::TExcEncoding);
        EXPECT_EQ(message.getString(false), L"@ 1 @(" + name + L") @(b)");
    }
}

TEST_F(CStringsMessageTest, ALeftoverWhoseNameIsNoTextRaisesAndAddsNothing) {
    TParameters list = oneAndTwo();
    list.add("\xFF", L"3");
    TMessage const message(std::wstring(L"@(a)"), list);
    EXPECT_THROW(message.insertParameters(true), Encoding::TExcEncoding);
    EXPECT_EQ(message.getString(false), L"1");
}

// Values.

TEST_F(CStringsMessageTest, AValueIsTakenInTurnAndThenTheFirstForGood) {
    TParameters const list = parameters({{"a", L"1"}, {"b", L"x"}, {"a", L"2"}});
    EXPECT_EQ(expand(L"@(a) @(a) @(a)", list), L"1 2 1");
    EXPECT_EQ(expand(L"@(a)@(b)@(a)@(b)@(a)@(a)", list), L"1x2x11");
    TLeftovers const second = {{"a", L"2"}, {"b", L"x"}};
    EXPECT_EQ(leftoversOf(L"@(a)", list), second);
    EXPECT_EQ(leftoversOf(L"@(a)@(b)@(a)", list), none);
}

TEST_F(CStringsMessageTest, EqualEntriesStandInTheOrderOfTheList) {
    TParameters const list =
        parameters({{"k", L"5"}, {"a", L"9"}, {"k", L"3"}, {"z", L"0"}, {"k", L"4"}, {"k", L"3"}});
    EXPECT_EQ(expand(L"@(k)@(k)@(k)@(k)@(k)", list), L"53435");
    TLeftovers const all = {{"a", L"9"}, {"k", L"5"}, {"k", L"3"},
                            {"k", L"4"}, {"k", L"3"}, {"z", L"0"}};
    EXPECT_EQ(leftoversOf(L"", list), all);
}

TEST_F(CStringsMessageTest, AnyNumberOfParametersIsServed) {
    for (int const count : {1, 63, 64, 65, 300}) {
        TParameters list;
        for (int i = 0; i < count; ++i)
            list.add("k", i);
        list.add("last", L"end");
        // One more use than there are values.
        std::wstring text;
        std::wstring expected;
        for (int i = 0; i <= count; ++i) {
            text += L"@(k) ";
            expected += std::to_wstring(i % count) + L" ";
        }
        EXPECT_EQ(expand(text, list), expected) << count;
        EXPECT_EQ(expandAll(text + L"@(last)", list), expected + L"end") << count;
        EXPECT_EQ(leftoversOf(text, list), (TLeftovers{{"last", L"end"}})) << count;
        EXPECT_EQ(expandAll(text, list), expected + L" (last: \"end\")") << count;
    }
}

TEST_F(CStringsMessageTest, AValueIsExpandedInItsTurn) {
    TParameters const list = parameters({{"a", L"@(b)"}, {"b", L"2"}});
    EXPECT_EQ(expand(L"@(a)", list), L"2");
    EXPECT_EQ(leftoversOf(L"@(a)", list), none);
    EXPECT_EQ(expand(L"@(a)", parameters({{"a", L"p@@q"}})), L"p@q");
    EXPECT_EQ(expand(L"@(a)@(a)", parameters({{"a", L"@(b)-"}, {"b", L"1"}, {"b", L"2"}})),
              L"1-2-");
}

TEST_F(CStringsMessageTest, AValueJoinsWithTheTextBehindIt) {
    EXPECT_EQ(expand(L"@(a))", parameters({{"a", L"@(b"}, {"b", L"2"}})), L"2");
    EXPECT_EQ(expand(L"@(a)(b)", parameters({{"a", L"x@"}, {"b", L"2"}})), L"x2");
    EXPECT_EQ(expand(L"@(a)@(b)", parameters({{"a", L"@"}, {"b", L"2"}})), L"@(b)");
    // What stands before it has been passed.
    EXPECT_EQ(expand(L"@@@(a)", parameters({{"a", L"(b)"}, {"b", L"2"}})), L"@(b)");
    EXPECT_EQ(expand(L"@(z@(a)", parameters({{"a", L")"}, {"z", L"26"}})), L"@(z)");
}

TEST_F(CStringsMessageTest, AnEmptyValueRemovesThePlaceholderAndIsUsed) {
    TParameters const list = parameters({{"a", L""}});
    EXPECT_EQ(expandAll(L"x@(a)y", list), L"xy");
    EXPECT_EQ(expandAll(L"@(a)", list), L"");
    EXPECT_EQ(expandAll(L"x", list), L"x (a: \"\")");
}

TEST_F(CStringsMessageTest, ExpansionLeavesTheParametersAsTheyAre) {
    TMessage const message(std::wstring(L"@(a)@(b)"), oneAndTwo());
    message.insertParameters(true);
    ASSERT_EQ(message.end() - message.begin(), 2);
    EXPECT_EQ(message.begin()->getName(), "a");
    EXPECT_EQ((message.begin() + 1)->getValue(), L"2");
}

// Leftovers.

TEST_F(CStringsMessageTest, LeftoversAreSortedByTheirBytes) {
    EXPECT_EQ(expandAll(L"x", parameters({{"b", L"2"}, {"a", L"1"}})), L"x (a: \"1\", b: \"2\")");
    EXPECT_EQ(expandAll(L"x", parameters({{"\xC3\xA9", L"4"},
                                          {"b", L"3"},
                                          {"Z", L"1"},
                                          {"", L"0"},
                                          {"a", L"2"},
                                          {"Z", L"1b"}})),
              L"x (: \"0\", Z: \"1\", Z: \"1b\", a: \"2\", b: \"3\", \u00E9: \"4\")");
}

TEST_F(CStringsMessageTest, LeftoverValuesAreWrittenAsTheyAre) {
    EXPECT_EQ(expandAll(L"@(b)", parameters({{"a", L"\"@(b)\", @@"}, {"b", L"2"}})),
              L"2 (a: \"\"@(b)\", @@\")");
}

TEST_F(CStringsMessageTest, AnEmptyTemplateGetsItsLeftovers) {
    EXPECT_EQ(expandAll(L"", parameters({{"a", L"1"}})), L" (a: \"1\")");
}

TEST_F(CStringsMessageTest, NoSuffixStandsWhereNothingIsLeft) {
    EXPECT_EQ(expandAll(L"x@(a)", TParameters()), L"x@(a)");
    EXPECT_EQ(expandAll(L"@(a)@(b)", oneAndTwo()), L"12");
    EXPECT_EQ(expandAll(L"", TParameters()), L"");
}

TEST_F(CStringsMessageTest, LeftoversAreAddedOnlyWhereTheyAreAskedFor) {
    TMessage const message(std::wstring(L"x"), oneAndTwo());
    EXPECT_EQ(message.getString(true), L"x");
    EXPECT_EQ(message.getString<std::string>(true), "x");
    message.insertParameters(true);
    EXPECT_EQ(message.getString(false), L"x (a: \"1\", b: \"2\")");
}

TEST_F(CStringsMessageTest, AFailedSystemCallReadsWithItsEncodingBehindIt) {
    TParameters list;
    list.add("eenc", 53);
    list.add("function", "CFStringGetBytes");
    list.add("error", "Could not get string with encoding UTF16");
    EXPECT_EQ(expandAll(L"Error in OS call @(function): @(error)", list),
              L"Error in OS call CFStringGetBytes: Could not get string with encoding UTF16 "
              L"(eenc: \"53\")");
}

// Further runs.

TEST_F(CStringsMessageTest, TheTemplateIsUntouchedUntilItIsExpanded) {
    TMessage const message(std::wstring(L"@@@(a)"), oneAndTwo());
    EXPECT_EQ(message.getString(false), L"@@@(a)");
    EXPECT_EQ(message.getString<std::string>(false), "@@@(a)");
    EXPECT_EQ(message.getString(true), L"@1");
    EXPECT_EQ(message.getString(false), L"@1");
    EXPECT_EQ(&message.getString(true), &message.getString(false));
}

TEST_F(CStringsMessageTest, TheNextRunFillsInWhatThisOneMadeOfTwoAtSigns) {
    CMessageProbe const message(std::wstring(L"@@(a) @@@@(b)"), oneAndTwo());
    EXPECT_EQ(message.getString(true), L"@(a) @@(b)");
    EXPECT_EQ(message.leftovers(), both);
    EXPECT_EQ(message.getString(true), L"1 @(b)");
    EXPECT_EQ(message.leftovers(), onlyB);
    EXPECT_EQ(message.getString(true), L"1 2");
    EXPECT_EQ(message.leftovers(), onlyA);
    EXPECT_EQ(message.getString(true), L"1 2");
    EXPECT_EQ(message.leftovers(), both);
}

TEST_F(CStringsMessageTest, ASecondRunReportsAllParametersAgain) {
    TMessage const message(std::wstring(L"@(a)"), oneAndTwo());
    message.insertParameters(true);
    EXPECT_EQ(message.getString(false), L"1 (b: \"2\")");
    message.insertParameters(true);
    EXPECT_EQ(message.getString(false), L"1 (b: \"2\") (a: \"1\", b: \"2\")");
}

TEST_F(CStringsMessageTest, TheNextRunReadsTheSuffixAsText) {
    TMessage const message(std::wstring(L"x"), parameters({{"a", L"@(b)@@"}, {"b", L"2"}}));
    message.insertParameters(true);
    EXPECT_EQ(message.getString(false), L"x (a: \"@(b)@@\", b: \"2\")");
    EXPECT_EQ(message.getString(true), L"x (a: \"2@\", b: \"2\")");
}

TEST_F(CStringsMessageTest, ParametersAddedBetweenTwoRunsFillWhatStayed) {
    TMessage message(std::wstring(L"@(a) @(c) @(d) @(e)"), oneAndTwo());
    EXPECT_EQ(message.getString(true), L"1 @(c) @(d) @(e)");
    message.add("c", 3);
    EXPECT_EQ(message.getString(true), L"1 3 @(d) @(e)");
    message.add(parameters({{"d", L"4"}}));
    EXPECT_EQ(message.getString(true), L"1 3 4 @(e)");
    TParameters const more = parameters({{"e", L"5"}});
    message.add(more.begin(), more.end());
    EXPECT_EQ(message.getString(true), L"1 3 4 5");
    EXPECT_EQ(message.end() - message.begin(), 5);
}

TEST_F(CStringsMessageTest, TwoTextsAreANameAndAValue) {
    TMessage message(std::wstring(L"@(key)"));
    message.add("key", "value");
    EXPECT_EQ(message.getString(true), L"value");
}

TEST_F(CStringsMessageTest, ACopyHasTheTextInItsPresentState) {
    TMessage const message(std::wstring(L"@(a)@@(b)"), oneAndTwo());
    TMessage const before(message);
    message.insertParameters(false);
    TMessage after(message);
    after.add("c", 3);
    EXPECT_EQ(before.getString(false), L"@(a)@@(b)");
    EXPECT_EQ(after.getString(false), L"1@(b)");
    EXPECT_EQ(after.getString(true), L"12");
    EXPECT_EQ(message.getString(false), L"1@(b)");
    EXPECT_EQ(message.end() - message.begin(), 2);
}

// Texts and streams.

TEST_F(CStringsMessageTest, ANarrowTemplateIsReadAsUTF8) {
    TMessage const message(std::string("caf\xC3\xA9 @(a)"), oneAndTwo());
    EXPECT_EQ(message.getString(true), L"caf\u00E9 1");
    EXPECT_EQ(TMessage(std::string("@(a)")).getString(true), L"@(a)");
    EXPECT_EQ(TMessage(std::string()).getString(true), L"");
    EXPECT_THROW(TMessage(std::string("caf\xC3")), Encoding::TExcEncoding);
}

TEST_F(CStringsMessageTest, TheTextIsHadInOtherStringKinds) {
    TMessage const message(std::wstring(L"caf\u00E9 @(a)"), oneAndTwo());
    EXPECT_EQ(message.getString<std::string>(false), "caf\xC3\xA9 @(a)");
    EXPECT_EQ(message.getString<std::string>(true), "caf\xC3\xA9 1");
    EXPECT_EQ(message.getString<std::wstring>(true), L"caf\u00E9 1");
}

TEST_F(CStringsMessageTest, AStreamGetsTheExpandedTextInItsOwnKind) {
    std::ostringstream narrow;
    std::wostringstream wide;
    TMessage const message(std::wstring(L"@(a) \u00E9\U0001F600 @@(b)"), oneAndTwo());
    narrow << message << "|";
    EXPECT_EQ(narrow.str(), "1 \xC3\xA9\xF0\x9F\x98\x80 @(b)|");
    // Writing is a run of its own.
    wide << message << L"|";
    EXPECT_EQ(wide.str(), L"1 \u00E9\U0001F600 2|");
}

// Subclasses.

// Answers what no parameter does.
class CAnswering : public CMessageProbe {
  public:
    using CMessageProbe::CMessageProbe;

    std::vector<std::string> const& asked() const { return asked_; }

  protected:
    std::wstring findMissingParamter(std::string const& name) const override {
        asked_.push_back(name);
        return name == "refer" ? L"<@(a)>" : name == "\xC3\xA9" ? L"@@" : L"";
    }

  private:
    mutable std::vector<std::string> asked_;
};

TEST_F(CStringsMessageTest, ASubclassAnswersWhatNoParameterDoes) {
    CAnswering const message(std::wstring(L"@(b)@(refer)@(\u00E9)@(z)@(b)@(a"), oneAndTwo());
    EXPECT_EQ(message.getString(true), L"2<1>@@(z)2@(a");
    EXPECT_EQ(message.asked(), (std::vector<std::string>{"refer", "\xC3\xA9", "z"}));
    EXPECT_EQ(message.leftovers(), none);
}

// Reads another language.
template <wchar_t escapeCharacter, wchar_t openCharacter, wchar_t closeCharacter>
class CForeign : public TMessage {
  public:
    using TMessage::TMessage;

  protected:
    void doInsertParameters(std::wstring& text, wchar_t, wchar_t const&, wchar_t const&,
                            TMap const& all, TMap& remaining) const override {
        TMessage::doInsertParameters(text, escapeCharacter, openCharacter, closeCharacter, all,
                                     remaining);
    }
};

TEST_F(CStringsMessageTest, ASubclassMayChooseTheThreeCharacters) {
    TParameters const list = parameters({{"a", L"1"}, {"b{c}", L"${a}"}});
    CForeign<L'$', L'{', L'}'> const message(std::wstring(L"${a} ${b{c}} $${a} @(a) @@ ${z} ${"),
                                             list);
    EXPECT_EQ(message.getString(true), L"1 1 ${a} @(a) @@ ${z} ${");
}

TEST_F(CStringsMessageTest, OneCharacterMayOpenAndClose) {
    CForeign<L'@', L'|', L'|'> const message(std::wstring(L"@|a||@|b|@|z| @|a"), oneAndTwo());
    EXPECT_EQ(message.getString(true), L"1|2@|z| @|a");
}

TEST_F(CStringsMessageTest, TheEscapeMayAlsoOpen) {
    CForeign<L'<', L'<', L'>'> const message(std::wstring(L"<<a>< <b>"), oneAndTwo());
    EXPECT_EQ(message.getString(true), L"1< <b>");
}

// Sees both maps and settles the leftovers itself.
class CTaking : public TMessage {
  public:
    using TMessage::TMessage;

    std::size_t seen() const { return seen_; }

  protected:
    void doInsertParameters(std::wstring& text, wchar_t escape, wchar_t const& open,
                            wchar_t const& close, TMap const& all, TMap& remaining) const override {
        seen_ = all.size();
        text += escape;
        text += open;
        text += close;
        text += all.lower_bound("a")->second;
        EXPECT_EQ(all, remaining);
        remaining.erase("b");
    }

  private:
    mutable std::size_t seen_ = 0;
};

TEST_F(CStringsMessageTest, ASubclassMayTakeTheExpansionOver) {
    CTaking const message(std::wstring(L"@(a)"),
                          parameters({{"c", L"3"}, {"a", L"1"}, {"b", L"2"}, {"b", L"2"}}));
    message.insertParameters(true);
    EXPECT_EQ(message.getString(false), L"@(a)@()1 (a: \"1\", c: \"3\")");
    EXPECT_EQ(message.seen(), 4U);
}

} // namespace
