/// @file
/// The reporting object: every message of the library goes through it.
#pragma once

#include "TessalExport.h"

namespace HostKit {

/// Level of a message, from the least to the most urgent.
enum class HkMessageLevel { Debug, Status, Info, Error };

/// One message as a handler sees it. All texts live only for the duration of the call.
struct HkMessage {
    HkMessageLevel level;
    const char* module;    ///< module tag of the reporting unit; null for a debug message
    const char* file;      ///< source path of the unit; null for a debug message
    int line;              ///< line of the report; 0 for a debug message
    const char* revision;  ///< revision text of the unit; null for a debug message
    const char* text;      ///< the formatted text, unchanged, with its own line end or without one
};

/// Takes the messages in place of the default output. It must not throw.
using HkMessageHandler = void (*)(const HkMessage&, void* context);

/// Sends messages at four levels to a handler or, by default, to the console.
///
/// Default output: status texts to standard output, information and error texts to standard error, debug texts to
/// standard error while the environment variable `ZRX_TESSAL_TRACE_FLAG` reads "ON" and nowhere otherwise. Texts go
/// out as they are: nothing is put before, between or behind them.
///
/// Reporting is safe from several threads: each message goes out whole, and a handler is called for one message at a
/// time. A handler may report itself, and may set another handler.
class TESSAL_API HkMessageManager {
public:
    /// Gives the calling thread's reporting object, set to this origin. Use it for one issue call in the same
    /// expression; the next createObject of the thread gives the same object with another origin.
    static HkMessageManager& createObject(const char* module, const char* file, int line, const char* revision);

    void issueError(const char* format, ...) TESSAL_PRINTF(2, 3);
    void issueInfo(const char* format, ...) TESSAL_PRINTF(2, 3);
    void issueStatus(const char* format, ...) TESSAL_PRINTF(2, 3);

    /// The debug channel: no origin. Costs a test and a return while nobody listens.
    static void debugStub(const char* format, ...) TESSAL_PRINTF(1, 2);

    /// Directs all messages to @p handler, which gets @p context with each; null restores the default output.
    /// When it returns, no other thread is inside the former handler.
    static void setHandler(HkMessageHandler handler, void* context);

    /// True while a debug message would go somewhere.
    static bool isDebugHeard();

    /// Reads the trace variable again and gives whether it is on. The manager reads it when it is first asked for a
    /// debug message; a caller that changes the variable later makes that known here. Building a DebugTrace does it
    /// too.
    static bool refreshTrace();

private:
    HkMessageManager() = default;
    HkMessageManager(const HkMessageManager&) = delete;
    HkMessageManager& operator=(const HkMessageManager&) = delete;

    HkMessage m_message{};
};

}  // namespace HostKit

using HostKit::HkMessage;
using HostKit::HkMessageHandler;
using HostKit::HkMessageLevel;
using HostKit::HkMessageManager;
