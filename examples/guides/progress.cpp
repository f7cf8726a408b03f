// Progress and PROMs of docs/guides.md: a device is compared with its file, row by row.

#include <TessalUtility.h>

#include <cstdio>
#include <memory>
#include <string>

namespace {

constexpr int rowBits = 64;
constexpr int rows = 4;

/// The user interface's side: gets each record that the filter lets through.
bool show(Callback& record) {
    if (record.getProgressStatus() == PROGRESS_UPDATE) {
        std::printf("%d of %d\n", record.getCurrentCount(), record.getTotalCount());
    }
    return true;
}

/// The operation's side. The last row gives the verdict, an information or an error message.
void verify(const std::string& file, const std::string& device) {
    int fileSum = 0;
    int deviceSum = 0;
    ProgressInterfaceClass::startProgressUpdate(rows, "Verifying");
    for (int row = 0; row < rows; ++row) {
        const auto begin = static_cast<std::size_t>(row * rowBits / 4);
        RLBitVec fileRow(rowBits);
        RLBitVec deviceRow(rowBits);
        Hex2Bit::convertHexString2BitVec(&fileRow, file.substr(begin, rowBits / 4), rowBits, true, true, true);
        Hex2Bit::convertHexString2BitVec(&deviceRow, device.substr(begin, rowBits / 4), rowBits, true, true, true);
        const std::unique_ptr<char[]> verdict(PromUtility::rowChecksum(0, &fileRow, rowBits, &deviceRow, rowBits,
                                                                       row == rows - 1, fileSum, deviceSum,
                                                                       row * rowBits, rows * rowBits));
        ProgressInterfaceClass::updateProgress();
    }
    ProgressInterfaceClass::endProgressUpdate();
}

}  // namespace

int main() {
    HkMessageManager::setHandler([](const HkMessage& message, void*) { std::printf("> %s", message.text); }, nullptr);
    ProgressInterfaceClass::setCallbackFunction(show);
    const std::string image(static_cast<std::size_t>(rows * rowBits / 4), '5');
    verify(image, image);
    std::string damaged = image;
    damaged[9] = '7';
    verify(image, damaged);
}
