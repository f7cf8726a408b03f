// The progress funnel, its filter, and the data file callback.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <iterator>
#include <limits>
#include <sstream>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "DFCallback.h"
#include "ProgressInterfaceClass.h"
#include "s/ProgressClock.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;
using Funnel = ProgressInterfaceClass;

constexpr int most = std::numeric_limits<int>::max();
constexpr int least = std::numeric_limits<int>::min();

std::vector<std::pair<int, int>> calls;  // status and current count
int now = 0;

bool record(Callback& progress) {
    calls.emplace_back(progress.getProgressStatus(), progress.getCurrentCount());
    return true;
}

class Progress : public testing::Test {
protected:
    Progress() {
        setProgressClock([] { return now; });
        now = 1;
        calls.clear();
        *Funnel::m_callback = CallbackFunction();
        Funnel::setCallbackFunction(record);
    }
    ~Progress() override {
        Funnel::setCallbackFunction(nullptr);
        setProgressClock(nullptr);
    }
};

TEST_F(Progress, ReachesTheFunctionOnceForEachPercent) {
    Funnel::startProgressUpdate(1000, "working");
    EXPECT_STREQ(Funnel::getCBData()->getCallbackText(), "working");
    for (int step = 0; step < 10; ++step) {
        Funnel::updateProgress();
    }
    Funnel::setProgressText("still");
    Funnel::endProgressUpdate();
    Funnel::startProgressUpdate(1000);
    Funnel::updateProgress();
    Funnel::stopProgressUpdate();
    EXPECT_THAT(calls, ElementsAre(Pair(PROGRESS_START, 0), Pair(PROGRESS_UPDATE, 1), Pair(PROGRESS_UPDATE, 10),
                                   Pair(PROGRESS_TEXT, 10), Pair(PROGRESS_END, 1000), Pair(PROGRESS_START, 0),
                                   Pair(PROGRESS_UPDATE, 1), Pair(PROGRESS_END, 1)));
}

TEST_F(Progress, UpdatesOfTheSamePercentAreHeldBackUntilASilenceOfMoreThanTenSeconds) {
    // An update that is held back starts the silence anew; the clock goes back once, and then passes its wrap. Percents
    // are computed in 32 bits: each of the last three is 0, as the one before them.
    constexpr int late = most - 5000;
    constexpr int wrapped = least + 5999;
    const std::tuple<int, int, int, bool> updates[] = {
        {1, 5, 100, true},           {500, 5, 100, false},           {11499, 5, 100, false},  {22499, 5, 100, true},
        {33498, 5, 100, false},      {-66502, 5, 100, false},        {-66502, 6, 100, true},  {late, 7, 100, true},
        {late, 7, 100, false},       {wrapped, 7, 100, true},        {wrapped, 0, 200, true}, {wrapped, 1, 200, false},
        {wrapped, least, -1, false}, {wrapped, 1 << 25, most, false}};
    for (const auto& [time, count, total, isThrough] : updates) {
        now = time;
        Callback progress;
        progress.setProgressStatus(PROGRESS_UPDATE);
        progress.setCurrentCount(count);
        progress.setTotalCount(total);
        EXPECT_EQ(Funnel::m_callback->callFunction(progress), isThrough) << count << " of " << total << " at " << time;
    }
}

TEST_F(Progress, GuardsStopCallsWithoutSteps) {
    EXPECT_TRUE(Funnel::startProgressUpdate(0));
    calls.clear();
    EXPECT_FALSE(Funnel::updateProgress());
    EXPECT_FALSE(Funnel::endProgressUpdate());
    Funnel::m_cbData->setProgressStatus(PROGRESS_UPDATE);
    EXPECT_FALSE(Funnel::callCallbackFunction());
    EXPECT_THAT(calls, IsEmpty());

    Funnel::startProgressUpdate(2);
    for (bool expected : {true, true, true, false, false}) {
        EXPECT_EQ(Funnel::updateProgress(), expected);
    }
    EXPECT_EQ(Funnel::m_cbData->getCurrentCount(), 3);
}

TEST_F(Progress, ResultsPassThrough) {
    Funnel::setCallbackFunction([](Callback&) { return false; });
    EXPECT_FALSE(Funnel::startProgressUpdate(5));
    Funnel::setCallbackFunction(nullptr);
    EXPECT_FALSE(Funnel::startProgressUpdate(7, nullptr));
}

TEST_F(Progress, IsLostWithoutARecord) {
    Callback* const kept = std::exchange(Funnel::m_cbData, nullptr);
    EXPECT_TRUE(Funnel::startProgressUpdate(5) && Funnel::updateProgress() && Funnel::setProgressText("x") &&
                Funnel::endProgressUpdate() && Funnel::stopProgressUpdate());
    Funnel::setTessalMode(tESSALNS::MODE_TYPE(1));
    Funnel::m_cbData = kept;
    EXPECT_THAT(calls, IsEmpty());
}

TEST(CallbackRecord, StreamsThreeNumbersAndItsTextOfWhichTheNumbersAreRead) {
    Callback progress;
    progress.setTotalCount(10);
    progress.setCurrentCount(3);
    progress.setProgressStatus(PROGRESS_UPDATE);
    progress.setCallbackText("x");
    std::stringstream stream;
    Callback(progress).writeStream(stream);
    EXPECT_EQ(stream.str(), "10\n3\n2\nx\n");
    Callback back;
    back.readStream(stream);
    EXPECT_EQ(std::tuple(back.getTotalCount(), back.getCurrentCount(), back.getProgressStatus()), std::tuple(10, 3, 2));
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(stream), {}), "\nx\n");
}

TEST(DataFileCallback, TheUsersInputMaySuppressTheCall) {
    DFCallback& file = *DFCallback::Instance();
    DFCallbackFunction function;
    EXPECT_FALSE(function.callFunction(&file)) << "there is no function";
    function.setFunction([](DFCallback& called) {
        called.setUseMode(called.getUseMode() + 1);
        return true;
    });
    EXPECT_FALSE(function.callFunction(nullptr));
    for (const auto& [input, isCalled] : {std::pair(0, true), {1, false}, {2, false}, {3, true}, {-1, true}}) {
        file.setUserInput(input);
        EXPECT_EQ(function.callFunction(&file), isCalled) << input;
    }
    EXPECT_EQ(file.getUseMode(), 3);
}

}  // namespace
