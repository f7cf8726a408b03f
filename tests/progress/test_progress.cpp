// The progress funnel, its filter, and the data file callback.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>
#include <sstream>
#include <string>
#include <tuple>
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
bool answer = true;

bool record(Callback& progress) {
    calls.emplace_back(progress.getProgressStatus(), progress.getCurrentCount());
    return answer;
}

class Progress : public testing::Test {
protected:
    Progress() {
        setProgressClock([] { return now; });
        now = 1;
        answer = true;
        calls.clear();
        *Funnel::m_callback = CallbackFunction();
        Funnel::setCallbackFunction(record);
    }
    ~Progress() override {
        Funnel::setCallbackFunction(nullptr);
        setProgressClock(nullptr);
    }

    /// Whether an update at this count reaches the function.
    static bool reaches(int total, int count) {
        Callback progress;
        progress.setProgressStatus(PROGRESS_UPDATE);
        progress.setTotalCount(total);
        progress.setCurrentCount(count);
        return Funnel::m_callback->callFunction(progress);
    }
};

TEST_F(Progress, ReachesTheFunctionOnceForEachPercent) {
    Funnel::startProgressUpdate(1000, "working");
    EXPECT_STREQ(Funnel::getCBData()->getCallbackText(), "working");
    for (int step = 0; step < 10; ++step) {
        Funnel::updateProgress();
    }
    Funnel::setProgressText("still");
    Funnel::setProgressText("still");
    Funnel::endProgressUpdate();
    Funnel::startProgressUpdate(1000);
    Funnel::updateProgress();
    Funnel::stopProgressUpdate();
    EXPECT_THAT(calls, ElementsAre(Pair(PROGRESS_START, 0), Pair(PROGRESS_UPDATE, 1), Pair(PROGRESS_UPDATE, 10),
                                   Pair(PROGRESS_TEXT, 10), Pair(PROGRESS_TEXT, 10), Pair(PROGRESS_END, 1000),
                                   Pair(PROGRESS_START, 0), Pair(PROGRESS_UPDATE, 1), Pair(PROGRESS_END, 1)));
}

TEST_F(Progress, ASilenceOfMoreThanTenSecondsLetsTheSamePercentThrough) {
    // An update that is held back starts the silence anew; the clock goes back once, and in the end passes its wrap.
    const std::tuple<int, int, bool> updates[] = {
        {1, 5, true},           {500, 5, false},        {11499, 5, false},
        {22499, 5, true},       {33498, 5, false},      {-66502, 5, false},
        {-66502, 6, true},      {most - 5000, 7, true}, {most - 5000, 7, false},
        {least + 5999, 7, true}};
    for (const auto& [time, percent, isThrough] : updates) {
        now = time;
        EXPECT_EQ(reaches(100, percent), isThrough) << percent << " % at " << time;
    }
}

TEST_F(Progress, PercentIsComputedIn32Bits) {
    // Those that are held back have the percent of the update before.
    const std::tuple<int, int, bool> updates[] = {{200, 10, true}, {200, 11, false},  {3, 2, true},
                                                  {3, 2, false},   {-1, least, true}, {1 << 30, 1 << 25, false}};
    for (const auto& [total, count, isThrough] : updates) {
        EXPECT_EQ(reaches(total, count), isThrough) << count << " of " << total;
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
    answer = false;
    EXPECT_FALSE(Funnel::startProgressUpdate(5));
    Funnel::setCallbackFunction(nullptr);
    EXPECT_FALSE(Funnel::startProgressUpdate(7, nullptr));
    EXPECT_EQ(Funnel::m_cbData->getTotalCount(), 7);
    Callback* const kept = Funnel::m_cbData;
    Funnel::m_cbData = nullptr;
    EXPECT_TRUE(Funnel::startProgressUpdate(5));
    EXPECT_TRUE(Funnel::updateProgress());
    EXPECT_TRUE(Funnel::setProgressText("x"));
    EXPECT_TRUE(Funnel::endProgressUpdate());
    Funnel::setTessalMode(tESSALNS::MODE_TYPE(1));
    Funnel::m_cbData = kept;
    EXPECT_EQ(kept->getMode(), 9);
    EXPECT_EQ(kept->getSubMode(), 7);
}

TEST(CallbackRecord, StreamsThreeNumbersAndItsText) {
    Callback progress;
    progress.setTotalCount(10);
    progress.setCurrentCount(3);
    progress.setProgressStatus(PROGRESS_UPDATE);
    progress.setCallbackText("x");
    progress.setMode(tESSALNS::MODE_TYPE(2));
    std::stringstream stream;
    progress.writeStream(stream);
    EXPECT_EQ(stream.str(), "10\n3\n2\nx\n");
    Callback back;
    back.setCallbackText("own");
    back.readStream(stream);
    EXPECT_EQ(std::tuple(back.getTotalCount(), back.getCurrentCount(), back.getProgressStatus()), std::tuple(10, 3, 2));
    EXPECT_STREQ(back.getCallbackText(), "own");
    std::string rest;
    stream >> rest;
    EXPECT_EQ(rest, "x");

    Callback copy(progress);
    progress.setCallbackText(nullptr);
    EXPECT_STREQ(copy.getCallbackText(), "x");
    EXPECT_EQ(copy.getMode(), 2);
}

TEST(DataFileCallback, TheUsersInputMaySuppressTheCall) {
    DFCallback& file = *DFCallback::Instance();
    EXPECT_EQ(&file, DFCallback::Instance());
    EXPECT_STREQ(file.getFileName(), "");
    EXPECT_EQ(file.getUserInput() + file.getUseMode() + file.getNumberOfFileInstances(), 0);
    DFCallbackFunction function;
    EXPECT_FALSE(function.callFunction(&file));
    function.setFunction([](DFCallback& called) {
        called.setUseMode(1);
        return true;
    });
    EXPECT_FALSE(function.callFunction(nullptr));
    for (const auto& [input, called] : {std::pair(0, true), {1, false}, {2, false}, {3, true}, {-1, true}}) {
        file.setUserInput(input);
        file.setUseMode(0);
        EXPECT_EQ(function.callFunction(&file), called) << input;
        EXPECT_EQ(file.getUseMode(), called ? 1 : 0);
    }
    file.setUserInput(0);
    file.setFileName("a.bit");
    const DFCallback copy(file);
    file.setFileName(nullptr);
    EXPECT_STREQ(copy.getFileName(), "a.bit");
    std::stringstream stream("7");
    file.writeStream(stream);
    file.readStream(stream);
    EXPECT_EQ(stream.str(), "7");
}

}  // namespace
