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
        *ProgressInterfaceClass::m_callback = CallbackFunction();
        ProgressInterfaceClass::setCallbackFunction(record);
    }
    ~Progress() override {
        ProgressInterfaceClass::setCallbackFunction(nullptr);
        setProgressClock(nullptr);
    }

    /// One update at the given percent of 100 steps; true when the function saw it.
    static bool reaches(int percent) {
        const std::size_t before = calls.size();
        ProgressInterfaceClass::m_cbData->setTotalCount(100);
        ProgressInterfaceClass::m_cbData->setCurrentCount(percent - 1);
        ProgressInterfaceClass::updateProgress();
        return calls.size() > before;
    }
};

TEST_F(Progress, ReachesTheFunctionOnceForEachPercent) {
    ProgressInterfaceClass::startProgressUpdate(1000, "working");
    EXPECT_STREQ(ProgressInterfaceClass::getCBData()->getCallbackText(), "working");
    for (int step = 0; step < 10; ++step) {
        ProgressInterfaceClass::updateProgress();
    }
    ProgressInterfaceClass::setProgressText("still");
    ProgressInterfaceClass::setProgressText("still");
    ProgressInterfaceClass::endProgressUpdate();
    ProgressInterfaceClass::startProgressUpdate(1000);
    ProgressInterfaceClass::updateProgress();
    ProgressInterfaceClass::stopProgressUpdate();
    EXPECT_THAT(calls, ElementsAre(Pair(PROGRESS_START, 0), Pair(PROGRESS_UPDATE, 1), Pair(PROGRESS_UPDATE, 10),
                                   Pair(PROGRESS_TEXT, 10), Pair(PROGRESS_TEXT, 10), Pair(PROGRESS_END, 1000),
                                   Pair(PROGRESS_START, 0), Pair(PROGRESS_UPDATE, 1), Pair(PROGRESS_END, 1)));
}

TEST_F(Progress, ASilenceOfMoreThanTenSecondsLetsTheSamePercentThrough) {
    EXPECT_TRUE(reaches(5));
    now = 500;
    EXPECT_FALSE(reaches(5));
    now = 500 + 10999;
    EXPECT_FALSE(reaches(5)) << "held back, and the silence starts anew";
    now += 11000;
    EXPECT_TRUE(reaches(5));
    now += 10999;
    EXPECT_FALSE(reaches(5));
    now -= 100000;
    EXPECT_FALSE(reaches(5)) << "a clock that went back";
    EXPECT_TRUE(reaches(6));
    now = std::numeric_limits<int>::max() - 5000;
    EXPECT_TRUE(reaches(7));
    EXPECT_FALSE(reaches(7));
    now = std::numeric_limits<int>::min() + 5999;
    EXPECT_TRUE(reaches(7)) << "11000 ticks across the wrap";
}

TEST_F(Progress, GuardsStopCallsWithoutSteps) {
    EXPECT_TRUE(ProgressInterfaceClass::startProgressUpdate(0));
    calls.clear();
    EXPECT_FALSE(ProgressInterfaceClass::updateProgress());
    EXPECT_FALSE(ProgressInterfaceClass::endProgressUpdate());
    ProgressInterfaceClass::m_cbData->setProgressStatus(PROGRESS_UPDATE);
    EXPECT_FALSE(ProgressInterfaceClass::callCallbackFunction());
    EXPECT_THAT(calls, IsEmpty());

    ProgressInterfaceClass::startProgressUpdate(2);
    for (bool expected : {true, true, true, false, false}) {
        EXPECT_EQ(ProgressInterfaceClass::updateProgress(), expected);
    }
    EXPECT_EQ(ProgressInterfaceClass::m_cbData->getCurrentCount(), 3);
}

TEST_F(Progress, PercentIsComputedIn32Bits) {
    constexpr int least = std::numeric_limits<int>::min();
    // Two counts of the same percent of each total.
    const std::tuple<int, int, int> cases[] = {
        {200, 10, 11}, {3, 2, 2}, {-1, least, least}, {1 << 30, 1 << 25, 1 << 25}};
    for (const auto& [total, first, second] : cases) {
        CallbackFunction filter;
        filter.setFunction(record);
        Callback progress;
        progress.setProgressStatus(PROGRESS_UPDATE);
        progress.setTotalCount(total);
        progress.setCurrentCount(first);
        EXPECT_TRUE(filter.callFunction(progress)) << total;
        progress.setCurrentCount(second);
        EXPECT_FALSE(filter.callFunction(progress)) << total;
    }
}

TEST_F(Progress, ResultsPassThrough) {
    answer = false;
    EXPECT_FALSE(ProgressInterfaceClass::startProgressUpdate(5));
    ProgressInterfaceClass::setCallbackFunction(nullptr);
    EXPECT_FALSE(ProgressInterfaceClass::startProgressUpdate(7, nullptr));
    EXPECT_EQ(ProgressInterfaceClass::m_cbData->getTotalCount(), 7);
    Callback* const kept = ProgressInterfaceClass::m_cbData;
    ProgressInterfaceClass::m_cbData = nullptr;
    EXPECT_TRUE(ProgressInterfaceClass::startProgressUpdate(5));
    EXPECT_TRUE(ProgressInterfaceClass::updateProgress());
    EXPECT_TRUE(ProgressInterfaceClass::setProgressText("x"));
    EXPECT_TRUE(ProgressInterfaceClass::endProgressUpdate());
    ProgressInterfaceClass::setTessalMode(tESSALNS::MODE_TYPE(1));
    ProgressInterfaceClass::m_cbData = kept;
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
