// What a running framework answered over ICU 72, row by row. Over another ICU the texts are ICU's
// own, told by the twin; over 72 the twin is held against the rows as well.

#include "0Platform/CoreFoundation/CFDateSupport.h"
#include "0Platform/CoreFoundation/CFDateTwin.h"

#include "support/TableFile.h"

#include <cstdio>
#include <string>
#include <vector>

namespace {

using namespace TestSupport;
using CFDateVectorsTest = CDateTest;

CLocalTime localTimeOf(std::string const& text) {
    CLocalTime time;
    EXPECT_EQ(std::sscanf(text.c_str(), "%d-%d-%d %d:%d:%d", &time.year, &time.month, &time.day,
                          &time.hour, &time.minute, &time.second),
              6)
        << text;
    return time;
}

TEST_F(CFDateVectorsTest, EachRowIsAnsweredAsTheFrameworkDoes) {
    std::size_t rows = 0;
    for (std::vector<std::string> const& row : readTable("dates.tsv")) {
        ASSERT_GE(row.size(), 7U);
        SCOPED_TRACE(row[0] + " " + row[1] + " " + row[2] + "/" + row[3] + " " + row[4]);
        ++rows;
        auto const dateStyle = static_cast<CFDateFormatterStyle>(std::stoi(row[2]));
        auto const timeStyle = static_cast<CFDateFormatterStyle>(std::stoi(row[3]));
        CLocalTime const time = localTimeOf(row[4]);
        ASSERT_EQ(row[5].substr(0, 2), "1/");
        CFAbsoluteTime at = std::stod(row[5].substr(2));
        std::u16string text = unitsOfHex(row[6]);
        CFAbsoluteTime const twinAt = twinComposed(row[1], time);
        std::u16string const twin = twinText(row[0], row[1], twinAt, dateStyle, timeStyle);
        if (isRecordedIcu()) {
            EXPECT_EQ(twinAt, at);
            EXPECT_EQ(twin, text) << readable(twin) << " is not " << readable(text);
        } else {
            at = twinAt;
            text = twin;
        }

        setLocale(row[0]);
        setZone(row[1]);
        EXPECT_EQ(composed(time), at);
        std::u16string const answer = textOf(at, dateStyle, timeStyle);
        EXPECT_EQ(answer, text) << readable(answer) << " is not " << readable(text);
    }
    EXPECT_EQ(rows, 629U);
}

} // namespace
