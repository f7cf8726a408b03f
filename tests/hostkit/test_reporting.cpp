#include <gtest/gtest.h>

#include <atomic>
#include <cstring>
#include <future>
#include <string>
#include <thread>
#include <type_traits>
#include <utility>
#include <vector>

#include "DebugTrace.h"
#include "EnvironmentVariable.h"
#include "HkFile.h"
#include "HkMessageManager.h"
#include "MessageRecorder.h"
#include "TessalException.h"
#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/Some", "$Revision: 1.8 $"};
constexpr const char* traceVariable = "ZRX_TESSAL_TRACE_FLAG";

using Texts = std::vector<std::string>;
using Printed = std::pair<std::string, std::string>;

/// What an action prints: on the standard output, on the error output.
template <class Action>
Printed printedBy(Action action) {
    testing::internal::CaptureStdout();
    testing::internal::CaptureStderr();
    action();
    std::fflush(stdout);
    std::string output = testing::internal::GetCapturedStdout();
    return {output, testing::internal::GetCapturedStderr()};
}

void debugLine() {
    HkMessageManager::debugStub("debug %d\n", 1);
}

TEST(MessageManager, SendsEachLevelToItsPlaceAndDebugLinesWhileTracedOrHandled) {
    EnvironmentVariable trace(traceVariable, nullptr);
    const auto reportAll = [] {
        origin.report().issueStatus("%d", 1);
        origin.report().issueStatus(" no line end");
        origin.report().issueInfo("info %s\n", "text");
        origin.report().issueError("error 100%%\n");
        debugLine();
    };
    EXPECT_FALSE(HkMessageManager::refreshTrace() || HkMessageManager::isDebugHeard());
    EXPECT_EQ(printedBy(reportAll), Printed("1 no line end", "info text\nerror 100%\n"));
    trace.set("oN");
    EXPECT_TRUE(HkMessageManager::refreshTrace() && HkMessageManager::isDebugHeard());
    EXPECT_EQ(printedBy(debugLine), Printed("", "debug 1\n"));
    trace.set("OFF");
    HkMessageManager::refreshTrace();
    const MessageRecorder recorder;
    debugLine();
    EXPECT_EQ(recorder.debug(), Texts{"debug 1\n"});
}

TEST(MessageManager, TellsAHandlerTheOrigin) {
    Texts seen;
    const auto handler = [](const HkMessage& message, void* context) {
        const auto shown = [](const char* text) { return std::string(text != nullptr ? text : "null") + "|"; };
        static_cast<Texts*>(context)->push_back(shown(message.module) + shown(message.file) + shown(message.revision) +
                                                std::to_string(message.line) + "|" + message.text);
    };
    HkMessageManager::setHandler(handler, &seen);
    HkMessageManager::createObject("tESSAL", "../s/Other", 12, "$Revision: 1.1 $").issueError("no %s", "good");
    debugLine();
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_EQ(seen, (Texts{"tESSAL|../s/Other|$Revision: 1.1 $|12|no good", "null|null|null|0|debug 1\n"}));
}

TEST(MessageManager, TakesTextsOfAnyLengthAndNoFormat) {
    const MessageRecorder recorder;
    Texts expected;
    for (const unsigned length : {0U, 1U, 510U, 511U, 512U, 513U, 1U << 20}) {
        expected.emplace_back(length, 'x');
        origin.report().issueStatus("%s", expected.back().c_str());
    }
    const char* const noFormat = nullptr;
    origin.report().issueStatus(noFormat);
    expected.emplace_back();
    EXPECT_EQ(recorder.status(), expected);
}

TEST(MessageManager, AHandlerMayReportAndReplaceItself) {
    Texts seen;
    const HkMessageHandler first = [](const HkMessage& message, void* context) {
        static_cast<Texts*>(context)->emplace_back(message.text);
        if (std::strcmp(message.text, "outer") == 0) {
            const HkMessageHandler second = [](const HkMessage& next, void* texts) {
                static_cast<Texts*>(texts)->push_back(std::string("second ") + next.text);
            };
            origin.report().issueInfo("inner");
            HkMessageManager::setHandler(second, context);
            origin.report().issueInfo("replaced");
            EXPECT_STREQ(message.text, "outer");
        }
    };
    HkMessageManager::setHandler(first, &seen);
    origin.report().issueStatus("outer");
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_EQ(seen, (Texts{"outer", "inner", "second replaced"}));
}

TEST(MessageManager, ServesThreadsOneMessageAtATime) {
    struct Seen {
        std::atomic<int> inside{0};
        std::vector<int> next = std::vector<int>(4);
        bool isGood = true;
    } seen;
    const auto handler = [](const HkMessage& message, void* context) {
        Seen& all = *static_cast<Seen*>(context);
        const bool isAlone = ++all.inside == 1;
        const int number = all.next[static_cast<std::size_t>(message.line)]++;
        all.isGood = all.isGood && isAlone && std::to_string(number) == message.text;
        std::this_thread::yield();  // lets in those that do not wait
        --all.inside;
    };
    HkMessageManager::setHandler(handler, &seen);
    const auto count = [](int line) {
        for (int number = 0; number < 500; ++number) {
            HkMessageManager::createObject("tESSAL", "../s/Some", line, "").issueInfo("%d", number);
        }
    };
    std::vector<std::future<void>> threads;
    for (int line = 0; line < 4; ++line) {
        threads.push_back(std::async(std::launch::async, count, line));
    }
    threads.clear();  // waits for them
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_TRUE(seen.isGood);
    EXPECT_EQ(seen.next, std::vector<int>(4, 500));
}

TEST(DebugTrace, PrintsOnlyWhenTheVariableReadsOn) {
    EnvironmentVariable trace(traceVariable, nullptr);
    DebugTrace assigned;
    for (const char* const value : {"", "1", "ONE", "ON", "oN", static_cast<const char*>(nullptr)}) {
        trace.set(value);
        const std::string shown = value != nullptr ? value : "-";
        const bool isOn = shown == "ON" || shown == "oN";
        const DebugTrace object;
        EXPECT_EQ(printedBy([&] { object.print("n %d", 5); }), Printed(isOn ? "n 5" : "", "")) << shown;
        assigned = object;
        trace.set(isOn ? nullptr : "ON");
        EXPECT_EQ(printedBy([&] { assigned.print("x"); }), Printed(isOn ? "x" : "", "")) << shown;
    }
    HkMessageManager::refreshTrace();
}

TEST(Console, ChainsTextsNumbersAndLineEnds) {
    const char* const nothing = nullptr;
    const auto chain = [&] { HkFile::getCout() << "Size " << -12 << nothing << HkStream::endl << "" << 0; };
    EXPECT_EQ(printedBy(chain), Printed("Size -12\n0", ""));
    EXPECT_EQ(&HkFile::getCout(), &HkFile::getCout());
}

static_assert(!std::is_base_of_v<LogicException, ACDEntryNotFoundException>);
static_assert(sizeof(ACDEntryNotFoundException) == sizeof(TessalException));

/// The exception can be caught as its base, and a copy of it still tells its own name.
template <class Exception, class Base>
void expectTells(const std::string& name) {
    static_assert(std::is_convertible_v<Exception*, Base*>);
    const MessageRecorder recorder;
    const Exception original("tESSAL", "../s/Some", "$Revision: 1.8 $", 42);
    Exception copy(original);
    static_cast<TessalException&>(copy).generateReport();
    ASSERT_EQ(recorder.info().size(), 1U);
    const std::string text = recorder.info().front();
    EXPECT_EQ(text.rfind(name + ": ", 0), 0U) << text;
    EXPECT_EQ(text.substr(text.find(" (")), " (tESSAL ../s/Some, line 42, $Revision: 1.8 $)\n");
    EXPECT_EQ(recorder.all().front().file, "../s/Some");
}

TEST(Exceptions, TellWhatAndWhere) {
    EXPECT_THROW(origin.raise<OutOfRangeException>(), LogicException);
    expectTells<TessalException, HkException>("TessalException");
    expectTells<LogicException, TessalException>("LogicException");
    expectTells<OutOfRangeException, LogicException>("OutOfRangeException");
    expectTells<DataMismatchException, LogicException>("DataMismatchException");
    expectTells<InvalidArgumentException, LogicException>("InvalidArgumentException");
    expectTells<DataNotFoundException, LogicException>("DataNotFoundException");
    expectTells<StreamException, TessalException>("StreamException");
    expectTells<FileException, StreamException>("FileException");
    expectTells<ACDFileException, FileException>("ACDFileException");
    expectTells<ACDEntryNotFoundException, ACDFileException>("ACDEntryNotFoundException");
}

TEST(Exceptions, SurviveOriginsOfAnyLength) {
    const std::string path(5000, 'p');
    const FileException exception(nullptr, path.c_str(), nullptr, -1);
    const std::string text = exception.what();
    EXPECT_EQ(std::wstring(exception.getLocalized()), std::wstring(text.begin(), text.end()));
    EXPECT_EQ(text.rfind("FileException", 0), 0U);
}

}  // namespace
