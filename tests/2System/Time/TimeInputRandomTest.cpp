// Random texts near the notations of dates and times, read by the streams and by a scanner that
// knows no stream.

#include "2System/Time/TimeScanner.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <random>
#include <string>

namespace {

using TimeTest::CScanned;

class CTimeInputRandomTest : public TestSupport::CErrorTest {
  protected:
    CTimeInputRandomTest() { std::printf("seed %u\n", seed_); }

    std::size_t below(std::size_t end) { return random_() % end; }

    char anyOf(std::string const& characters) { return characters[below(characters.size())]; }

    // One of the texts with a few characters put in, taken out or replaced.
    template <std::size_t count>
    std::string near(char const* const (&texts)[count], std::string const& alphabet) {
        std::string text = texts[below(count)];
        for (std::size_t changes = below(4); changes > 0; --changes) {
            std::size_t const at = below(text.size() + 1);
            switch (below(3)) {
            case 0:
                text.insert(at, 1, anyOf(alphabet));
                break;
            case 1:
                text.erase(at, 1);
                break;
            default:
                if (at < text.size())
                    text[at] = anyOf(alphabet);
            }
        }
        return text;
    }

  private:
    static constexpr unsigned seed_ = 20210305;
    std::mt19937 random_{seed_};
};

TEST_F(CTimeInputRandomTest, DatesAreReadAsByTheScanner) {
    constexpr char const* texts[] = {"05.03.2021",  "2021-03-05",
                                     "03/05/2021",  "05.JJJ 2021",
                                     "2021-JJJ 05", "1.1.10000",
                                     "29.02.2000",  " 5 . 3 . 1",
                                     "31-SSS 1999", "12/31/1400",
                                     "-1.+3.67557", "2147483648.1",
                                     "5.",          ""};
    std::string const alphabet = "0123456789012345678901234567890.-/.-/+-JFMASONDjx \t\n:,";
    int dates = 0;
    for (int i = 0; i < 100000; ++i) {
        std::string const text = near(texts, alphabet);
        CScanned<3> const expected = TimeTest::scanned<3>(text, TimeTest::scanDate);
        ASSERT_EQ((TimeTest::streamed<3, char>(text, TimeTest::readDateFields)), expected)
            << '"' << text << '"';
        ASSERT_EQ((TimeTest::streamed<3, wchar_t>(text, TimeTest::readDateFields)), expected)
            << '"' << text << '"';
        dates += expected.fields ? 1 : 0;
    }
    EXPECT_GT(dates, 20000);
}

TEST_F(CTimeInputRandomTest, TimesAreReadAsByTheScanner) {
    constexpr char const* texts[] = {"08:05",    "08:05:09", "08:05:09:123", "08`05`09`123", "8:5",
                                     "25:99:99", "-1:+2:-3", "08:05 ",       "8:5:9 x",      "8:"};
    std::string const alphabet = "01234567890123456789::``.+- x\t";
    int times = 0;
    for (int i = 0; i < 100000; ++i) {
        std::string const text = near(texts, alphabet);
        CScanned<4> const expected = TimeTest::scanned<4>(text, TimeTest::scanTime);
        ASSERT_EQ((TimeTest::streamed<4, char>(text, TimeTest::readTimeFields)), expected)
            << '"' << text << '"';
        ASSERT_EQ((TimeTest::streamed<4, wchar_t>(text, TimeTest::readTimeFields)), expected)
            << '"' << text << '"';
        times += expected.fields ? 1 : 0;
    }
    EXPECT_GT(times, 20000);
}

} // namespace
