#include <gmock/gmock.h>
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

using testing::_;
using testing::ElementsAre;
using testing::FieldsAre;
using testing::IsNull;
using testing::StrEq;

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

TEST(MessageManager, SendsEachLevelToItsPlaceAndTheConsoleWritesAmongThem) {
    const auto reportAll = [] {
        origin.report().issueStatus("%d", 1);
        HkFile::getCout() << "" << -12 << static_cast<const char*>(nullptr) << HkStream::endl << "text";
        origin.report().issueInfo("info %s\n", "text");
        origin.report().issueError("error 100%%\n");
    };
    EXPECT_EQ(printedBy(reportAll), Printed("1-12\ntext", "info text\nerror 100%\n"));
}

TEST(MessageManager, DebugLinesAndTracesGoOutWhileTheVariableReadsOnOrAHandlerHears) {
    EnvironmentVariable trace(traceVariable, nullptr);
    for (const auto& [value, isOn] :
         {std::pair("ON", true), {"", false}, {"1", false}, {"oN", true}, {"ONE", false}, {nullptr, false}}) {
        trace.set(value);
        const DebugTrace object;
        trace.set(isOn ? nullptr : "ON");  // too late
        EXPECT_EQ(HkMessageManager::isDebugHeard(), isOn);
        EXPECT_EQ(printedBy([&] { object.print("n %d", 5); }), Printed(isOn ? "n 5" : "", ""));
        EXPECT_EQ(printedBy(debugLine), Printed("", isOn ? "debug 1\n" : ""));
    }
    const MessageRecorder recorder;
    debugLine();
    EXPECT_EQ(recorder.debug(), Texts{"debug 1\n"});
}

TEST(MessageManager, TellsAHandlerTheOrigin) {
    std::vector<HkMessage> seen;  // their texts are gone, the other ones are constants
    const auto handler = [](const HkMessage& message, void* context) {
        static_cast<std::vector<HkMessage>*>(context)->push_back(message);
    };
    HkMessageManager::setHandler(handler, &seen);
    HkMessageManager::createObject("tESSAL", "../s/Other", 12, "$Revision: 1.1 $").issueError("no %s", "good");
    debugLine();
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_THAT(seen, ElementsAre(FieldsAre(HkMessageLevel::Error, StrEq("tESSAL"), StrEq("../s/Other"), 12,
                                            StrEq("$Revision: 1.1 $"), _),
                                  FieldsAre(HkMessageLevel::Debug, IsNull(), IsNull(), 0, IsNull(), _)));
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
    const HkMessageHandler handler = [](const HkMessage& message, void* context) {
        static_cast<Texts*>(context)->emplace_back(message.text);
        if (std::strcmp(message.text, "outer") == 0) {
            origin.report().issueInfo("inner");
            HkMessageManager::setHandler(nullptr, nullptr);
            EXPECT_STREQ(message.text, "outer");
        }
    };
    HkMessageManager::setHandler(handler, &seen);
    origin.report().issueStatus("outer");
    EXPECT_EQ(printedBy([] { origin.report().issueStatus("next"); }), Printed("next", ""));
    EXPECT_EQ(seen, (Texts{"outer", "inner"}));
}

TEST(MessageManager, ServesThreadsOneMessageAtATime) {
    std::atomic<int> heard{0};
    const auto handler = [](const HkMessage& message, void* context) {
        std::atomic<int>& count = *static_cast<std::atomic<int>*>(context);
        const int before = count;
        std::this_thread::yield();  // lets in those that do not wait
        EXPECT_EQ(count++, before);
        EXPECT_EQ(std::to_string(message.line), message.text);
    };
    HkMessageManager::setHandler(handler, &heard);
    const auto report = [](int first) {
        for (int number = first; number < first + 500; ++number) {
            HkMessageManager::createObject("tESSAL", "../s/Some", number, "").issueInfo("%d", number);
        }
    };
    std::vector<std::future<void>> threads;
    for (const int first : {0, 1000, 2000, 3000}) {
        threads.push_back(std::async(std::launch::async, report, first));
    }
    threads.clear();  // waits for them
    HkMessageManager::setHandler(nullptr, nullptr);
    EXPECT_EQ(heard.load(), 4 * 500);
}

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
