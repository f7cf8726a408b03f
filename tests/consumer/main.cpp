// Uses a few classes across the library's border: text, messages, and an exception thrown there and caught here.
#include <TessalUtility.h>

#include <cstdio>
#include <cstring>
#include <string>

namespace {

int failures = 0;

void check(bool holds, const char* what) {
    if (!holds) {
        std::printf("failed: %s\n", what);
        ++failures;
    }
}

void append(const HkMessage& message, void* context) {
    *static_cast<std::string*>(context) += message.text;
}

void useText() {
    HkString name("lpt");
    name.MakeUpper();
    name += '1';
    check(name == "LPT1" && name.Length() == 4, "text");
}

void useMessages() {
    std::string heard;
    HkMessageManager::setHandler(append, &heard);
    HkMessageManager::createObject("consumer", "main", __LINE__, "1").issueInfo("cable %d\n", 7);
    HkMessageManager::setHandler(nullptr, nullptr);
    check(heard == "cable 7\n", "messages");
}

void useExceptions() {
    try {
        throw DataMismatchException("consumer", "main", "1", __LINE__);
    } catch (const LogicException& exception) {
        check(std::strstr(exception.what(), "DataMismatchException") != nullptr, "exceptions");
    }
}

}  // namespace

int main() {
    useText();
    useMessages();
    useExceptions();
    return failures == 0 ? 0 : 1;
}
