#include <gtest/gtest.h>

#include <atomic>
#include <cstring>
#include <string>
#include <thread>
#include <type_traits>
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

/// What goes to the console while an action runs.
struct Console {
    template <class Action>
    explicit Console(Action action) {
        testing::internal::CaptureStdout();
        testing::internal::CaptureStderr();
        action();
        std::fflush(stdout);
        output = testing::internal::GetCapturedStdout();
        errors = testing::internal::GetCapturedStderr();
    }
    std::string output;
    std::string errors;
};

void debugLine() {
    HkMessageManager::debugStub("debug %d\n", 1);
}

TEST(MessageManager, SendsEachLevelToItsPlaceUnchanged) {
    const EnvironmentVariable trace(traceVariable, nullptr);
    HkMessageManager::refreshTrace();
    const Console console([] {
        origin.report().issueStatus("%d", 1);
        origin.report().issueStatus(" no line end");
        origin.report().issueInfo("info %s\n", "text");
        origin.report().issueError("error 100%%\n");
        debugLine();
    });
    EXPECT_EQ(console.output, "1 no line end");
    EXPECT_EQ(console.errors, "info text\nerror 100%\n");
}

TEST(MessageManager, HearsDebugLinesWhileTracedOrHandled) {
    EnvironmentVariable trace(traceVariable, nullptr);
    EXPECT_FALSE(HkMessageManager::refreshTrace());
    EXPECT_FALSE(HkMessageManager::isDebugHeard());
    EXPECT_EQ(Console(debugLine).errors, "");
    trace.set("oN");
    EXPECT_TRUE(HkMessageManager::refreshTrace());
    EXPECT_TRUE(HkMessageManager::isDebugHeard());
    EXPECT_EQ(Console(debugLine).errors, "debug 1\n");
    trace.set("OFF");
    HkMessageManager::refreshTrace();
    const MessageRecorder recorder;
    debugLine();
    EXPECT_EQ(recorder.debug(), std::vector<std::string>{"debug 1\n"});
}

TEST(MessageManager, TellsAHandlerTheOrigin) {
    std::vector<std::string> seen;
    const auto handler = [](const HkMessage& message, void* context) {
        const auto shown = [](const char* text) { return std::string(text != nullptr ? text : "null"); };
        static_cast<std::vector<std::string>*>(context)->push_back(shown(message.module) + "|" + shown(message.file) +
                                                                   "|" + std::to_string(message.line) + "|" +
                                                                   shown(message.revision) + "|" + message.text);
    };
    HkMessageManager::setHandler(handler, &seen);
    HkMessageManager::createObject("tESSAL", "../s/Other", 12, "$Revision: 1.1 $").issueError("no %s", "good");
    debugLine();
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_EQ(seen, (std::vector<std::string>{"tESSAL|../s/Other|12|$Revision: 1.1 $|no good",
                                              "null|null|0|null|debug 1\n"}));
}

TEST(MessageManager, TakesTextsOfAnyLengthAndNoFormat) {
    const MessageRecorder recorder;
    std::vector<std::string> expected;
    for (const std::size_t length : {0, 1, 510, 511, 512, 513, 1 << 20}) {
        expected.emplace_back(length, 'x');
        origin.report().issueStatus("%s", expected.back().c_str());
    }
    const char* const noFormat = nullptr;
    origin.report().issueStatus(noFormat);
    expected.emplace_back();
    EXPECT_EQ(recorder.status(), expected);
}

TEST(MessageManager, AHandlerMayReportAndReplaceItself) {
    static std::vector<std::string> seen;
    seen.clear();
    const HkMessageHandler second = [](const HkMessage& message, void*) {
        seen.push_back(std::string("second ") + message.text);
    };
    const HkMessageHandler first = [](const HkMessage& message, void* context) {
        seen.push_back(message.text);
        if (std::strcmp(message.text, "outer") == 0) {
            origin.report().issueInfo("inner");
            HkMessageManager::setHandler(*static_cast<HkMessageHandler*>(context), nullptr);
            origin.report().issueInfo("replaced");
            EXPECT_STREQ(message.text, "outer");
        }
    };
    HkMessageHandler replacement = second;
    HkMessageManager::setHandler(first, &replacement);
    origin.report().issueStatus("outer");
    origin.report().issueStatus("next");
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_EQ(seen, (std::vector<std::string>{"outer", "inner", "second replaced", "second next"}));
}

TEST(MessageManager, ServesThreadsOneMessageAtATime) {
    constexpr int threadCount = 4;
    constexpr int messageCount = 500;
    struct Seen {
        std::atomic<int> inside{0};
        int next[threadCount] = {};
        bool isGood = true;
    } seen;
    const auto handler = [](const HkMessage& message, void* context) {
        Seen& all = *static_cast<Seen*>(context);
        const bool isAlone = ++all.inside == 1;
        int& next = all.next[message.line];
        all.isGood = all.isGood && isAlone && std::to_string(next) == message.text;
        ++next;
        --all.inside;
    };
    HkMessageManager::setHandler(handler, &seen);
    std::vector<std::thread> threads;
    for (int i = 0; i < threadCount; ++i) {
        threads.emplace_back([i] {
            for (int number = 0; number < messageCount; ++number) {
                HkMessageManager::createObject("tESSAL", "../s/Some", i, "").issueInfo("%d", number);
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_TRUE(seen.isGood);
    for (const int count : seen.next) {
        EXPECT_EQ(count, messageCount);
    }
}

TEST(DebugTrace, PrintsOnlyWhenTheVariableReadsOn) {
    struct Case {
        const char* value;
        const char* printed;
    };
    EnvironmentVariable trace(traceVariable, nullptr);
    for (const Case& c : {Case{nullptr, ""}, {"", ""}, {"1", ""}, {"ONE", ""}, {"ON", "n 5"}, {"oN", "n 5"}}) {
        trace.set(c.value);
        const DebugTrace object;
        EXPECT_EQ(Console([&] { object.print("n %d", 5); }).output, c.printed) << (c.value != nullptr ? c.value : "-");
    }
    const DebugTrace original;
    trace.set(nullptr);
    DebugTrace assigned;
    EXPECT_EQ(Console([&] { assigned.print("x"); }).output, "");
    assigned = original;
    EXPECT_EQ(Console([&] { assigned.print("x"); }).output, "x");
    HkMessageManager::refreshTrace();
}

TEST(Console, ChainsTextsNumbersAndLineEnds) {
    const Console console([] {
        const char* const nothing = nullptr;
        HkFile::getCout() << "Size " << -12 << nothing << HkStream::endl << "" << 0;
    });
    EXPECT_EQ(console.output, "Size -12\n0");
    EXPECT_EQ(&HkFile::getCout(), &HkFile::getCout());
}

template <class Derived, class... Bases>
constexpr bool derivesFrom = (std::is_base_of_v<Bases, Derived> && ...);

TEST(Exceptions, FormOneChain) {
    static_assert(derivesFrom<OutOfRangeException, LogicException, TessalException, HkException>);
    static_assert(derivesFrom<DataMismatchException, LogicException>);
    static_assert(derivesFrom<InvalidArgumentException, LogicException>);
    static_assert(derivesFrom<DataNotFoundException, LogicException>);
    static_assert(derivesFrom<ACDEntryNotFoundException, ACDFileException, FileException, StreamException,
                              TessalException, HkException>);
    static_assert(!derivesFrom<ACDEntryNotFoundException, LogicException>);
    static_assert(sizeof(ACDEntryNotFoundException) == sizeof(TessalException));
    EXPECT_THROW(origin.raise<OutOfRangeException>(), LogicException);
    EXPECT_THROW(origin.raise<ACDEntryNotFoundException>(), StreamException);
}

template <class Exception>
void expectTells(const char* name) {
    const MessageRecorder recorder;
    try {
        throw Exception("tESSAL", "../s/Some", "$Revision: 1.8 $", 42);
    } catch (HkException& caught) {
        Exception copy = dynamic_cast<Exception&>(caught);
        TessalException& base = copy;
        base.generateReport();
    }
    ASSERT_EQ(recorder.info().size(), 1U);
    const std::string text = recorder.info().front();
    for (const char* part : {name, ": ", "tESSAL", "../s/Some", "$Revision: 1.8 $", "line 42"}) {
        EXPECT_NE(text.find(part), std::string::npos) << text << " lacks " << part;
    }
    EXPECT_EQ(recorder.all().front().file, "../s/Some");
}

TEST(Exceptions, TellWhatAndWhere) {
    expectTells<TessalException>("TessalException");
    expectTells<LogicException>("LogicException");
    expectTells<OutOfRangeException>("OutOfRangeException");
    expectTells<DataMismatchException>("DataMismatchException");
    expectTells<InvalidArgumentException>("InvalidArgumentException");
    expectTells<DataNotFoundException>("DataNotFoundException");
    expectTells<StreamException>("StreamException");
    expectTells<FileException>("FileException");
    expectTells<ACDFileException>("ACDFileException");
    expectTells<ACDEntryNotFoundException>("ACDEntryNotFoundException");
}

TEST(Exceptions, SurviveOriginsOfAnyLength) {
    const std::string path(5000, 'p');
    const FileException exception(nullptr, path.c_str(), nullptr, -1);
    const std::string text = exception.what();
    EXPECT_EQ(std::wstring(exception.getLocalized()), std::wstring(text.begin(), text.end()));
    EXPECT_EQ(text.rfind("FileException", 0), 0U);
}

}  // namespace
