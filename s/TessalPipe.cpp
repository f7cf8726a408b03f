#include "TessalPipe.h"

#include "HkStr.h"
#include "platform/LocalPipe.h"
#include "s/FieldChannel.h"
#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/TessalPipe", "$Revision: 1.1 $"};

constexpr TransferReports reports{
    origin,         "ReadFile failed: %d\n", "WriteFile failed: %d\n", "TessalSocket::writeString error.\n",
    " read : %d\n", " write : %d\n"};

platform::Pipe asPipe(void* handle) {
    return reinterpret_cast<platform::Pipe>(handle);
}

void* asHandle(platform::Pipe pipe) {
    return reinterpret_cast<void*>(pipe);  // NOLINT(performance-no-int-to-ptr): a handle is a number behind a pointer
}

/// Puts a pipe in the place of a former one, which is closed.
void replace(void*& handle, platform::Pipe pipe) {
    if (asPipe(handle) != platform::noPipe) {
        platform::pipeHost().close(asPipe(handle));
    }
    handle = asHandle(pipe);
}

/// The part of a handle that messages show.
unsigned int shown(void* handle) {
    return static_cast<unsigned int>(asPipe(handle));
}

class PipeChannel final : public FieldChannel {
public:
    explicit PipeChannel(void* handle) : FieldChannel(reports), m_pipe(asPipe(handle)) {}

private:
    std::int64_t receiveSome(char* data, int length) override {
        return platform::pipeHost().read(m_pipe, data, length);
    }
    std::int64_t sendSome(const char* data, int length) override {
        return platform::pipeHost().write(m_pipe, data, length);
    }
    int failure() const override { return platform::pipeHost().lastError(); }

    platform::Pipe m_pipe;
};

}  // namespace

TessalPipe::TessalPipe(int role, const char* pipeName) : m_role(role), m_handle(asHandle(platform::noPipe)) {
    if (HkStr::Len(pipeName) < sizeof m_pipeName) {
        HkStr::Copy(m_pipeName, pipeName);
    }
}

TessalPipe::~TessalPipe() {
    close(nullptr);
}

bool TessalPipe::initialize() {
    return m_role == 1 ? initializeSocketInClient() : initializeSocketInServer();
}

bool TessalPipe::initializeSocketInServer() {
    if (platform::pipeHost().exists(m_pipeName)) {
        return true;
    }
    replace(m_handle, platform::pipeHost().create(m_pipeName));
    if (asPipe(m_handle) == platform::noPipe) {
        return false;
    }
    HkMessageManager::debugStub(" Server pipe %s created. fd=0x%X.\n", m_pipeName, shown(m_handle));
    return true;
}

bool TessalPipe::initializeSocketInClient() {
    replace(m_handle, platform::noPipe);
    m_handle = asHandle(platform::pipeHost().open(m_pipeName));
    if (asPipe(m_handle) == platform::noPipe) {
        HkMessageManager::debugStub(" Create pipe failed, status = %d.\n", getLastError());
        return false;
    }
    HkMessageManager::debugStub(" Client pipe %s created. fd = 0x%X.\n", m_pipeName, shown(m_handle));
    return true;
}

bool TessalPipe::connectToServer() {
    return true;
}

bool TessalPipe::waitForClient() {
    if (!m_connected) {
        m_connected = platform::pipeHost().waitForClient(asPipe(m_handle));
    }
    return m_connected;
}

bool TessalPipe::deinitialize() {
    closeHandle("Closing pipe %s, handle=%0X in deinitialize.\n");
    return true;
}

bool TessalPipe::close(void*) {
    closeHandle("Closing pipe %s, handle=%0X.\n");
    return true;
}

void TessalPipe::closeHandle(const char* format) {
    if (asPipe(m_handle) == platform::noPipe) {
        return;
    }
    HkMessageManager::debugStub(format, m_pipeName, shown(m_handle));
    platform::pipeHost().close(asPipe(m_handle));
    m_handle = asHandle(platform::noPipe);
}

bool TessalPipe::read(void* handle, char* data, int length) {
    return PipeChannel(handle).read(data, length);
}

bool TessalPipe::write(void* handle, const char* data, int length) {
    return PipeChannel(handle).write(data, length);
}

int TessalPipe::readInt(void* handle, int* value) {
    return PipeChannel(handle).readInt(value);
}

int TessalPipe::writeInt(void* handle, int value) {
    return PipeChannel(handle).writeInt(value);
}

bool TessalPipe::readBool(void* handle, bool* value) {
    return PipeChannel(handle).readBool(value);
}

bool TessalPipe::writeBool(void* handle, bool value) {
    return PipeChannel(handle).writeBool(value);
}

int TessalPipe::writeString(void* handle, const char* text) {
    return PipeChannel(handle).writeString(text);
}

bool TessalPipe::readSocket(char* data, int length) {
    return PipeChannel(m_handle).readSocket(data, length);
}

bool TessalPipe::writeSocket(const char* data, int length) {
    return PipeChannel(m_handle).writeSocket(data, length);
}

int TessalPipe::getLastError() {
    return platform::pipeHost().lastError();
}
