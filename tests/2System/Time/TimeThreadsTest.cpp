// Several threads at work on dates of their own: nothing they use is shared.

#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeReadOutcome.h"
#include "support/Registry.h"
#include "support/Zone.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>
#include <thread>
#include <vector>

namespace {

using Time::CDate;
using Time::CDateTime;
using Time::CTimeZone;
using TimeTest::show;

using CTimeThreadsTest = TestSupport::CErrorTest;

CDateTime momentOf(int number) {
    return CDateTime(1 + number % 28, CDate::emMar, 2000 + number, 8, 5, number % 60, 0);
}

std::string writtenAndRead(CDateTime const& moment) {
    CTimeZone zone;
    CDateTime::getCurrentTimeLocal(zone);
    std::wstringstream stream;
    stream << moment;
    return show(TimeTest::readISO(TimeTest::narrow(moment.getAsISOdate(zone)), true)) + ' ' +
           show(TimeTest::readPDF(moment.getAsPDFdate(), true)) + ' ' +
           show(CDateTime::readDateTime(stream)) + ' ' + show(moment.format(L"D.M.YYYY hh:mm:ss")) +
           ' ' + show(moment.format(CDateTime::efFull, CDateTime::efLong, L", "));
}

std::string failures(int number) {
    std::string const year = std::to_string(number);
    return show(TimeTest::readISO(year + 'x', false)) + show(TimeTest::readPDF(year + 'x', false)) +
           TimeTest::outcomeOf(
               [&] { return CDateTime(31, CDate::emFeb, number, 0, 0, 0, 0).format(L""); });
}

std::string workOf(int number) {
    CDateTime moment = momentOf(number);
    std::string text = writtenAndRead(moment) + failures(1000 + number);
    moment.addSeconds(static_cast<unsigned>(number) * 100000U);
    text += std::to_string(moment - momentOf(number)) + std::to_string(moment.getDayOfWeek());
    return text;
}

TEST_F(CTimeThreadsTest, EachThreadGetsWhatItWouldGetAlone) {
    constexpr int threadCount = 4;
    constexpr int rounds = 100;
    TestSupport::CZone const zone("XYZ5"); // at all times the same
    std::vector<std::string> alone;
    for (int round = 0; round < rounds; ++round)
        alone.push_back(workOf(round));

    std::vector<std::vector<std::string>> together(threadCount);
    std::vector<std::thread> threads;
    for (std::vector<std::string>& texts : together)
        threads.emplace_back([&texts] {
            for (int round = 0; round < rounds; ++round)
                texts.push_back(workOf(round));
        });
    for (std::thread& thread : threads)
        thread.join();
    for (std::vector<std::string> const& texts : together)
        EXPECT_EQ(texts, alone);
}

} // namespace
