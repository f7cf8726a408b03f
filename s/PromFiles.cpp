// File generation and file sizes of PromUtility.

#include <string_view>

#include "HkCmdArgs.h"
#include "HkFile.h"
#include "HkPath.h"
#include "HkStr.h"
#include "IF_IMAGEGEN.h"
#include "M2IUtil_Data_Utils.h"
#include "PromUtility.h"
#include "s/PromUtilityOrigin.h"

namespace {

bool isObjectOrMemory(const char* path) {
    const std::string_view extension = HkStr::View(HkPath::GetExt(path, nullptr));
    return extension == "elf" || extension == "mem";
}

unsigned int sectionSpan(const char* path) {
    M2IUtil_BramMapping::M2IUtil_Results result = M2IUtil_BramMapping::M2IUTIL_SUCCESS;
    const M2IUtil_Data_Utils reader(path, DUMP_BY_DEFAULT, &result);
    if (result != M2IUtil_BramMapping::M2IUTIL_SUCCESS) {
        promUtilityOrigin.report().issueError("M2IUtil processing of file '%s' failed.\n", path);
        return 0;
    }
    unsigned int lowest = 0;
    unsigned int highest = 0;
    reader.GetProgramSectionAddressRange(&lowest, &highest);
    HkMessageManager::debugStub("highest %x, lowest %x\n", highest, lowest);
    return highest - lowest;
}

}  // namespace

bool PromUtility::generate(CommandSet* command) {
    HkMessageManager::debugStub("Command is...");
    if (command == nullptr) {
        return false;
    }
    command->printCommands(false);
    const HkCmdArgs args(command->getNumberCommands(), command->getCommands(), IF_IMAGEGEN::getcmdformat(), nullptr, 0);
    IF_IMAGEGEN generator(&args);
    return generator.makeprom() == 0;
}

unsigned int PromUtility::getDataFileSize(const char* path) {
    if (path == nullptr) {
        return 0;
    }
    return isObjectOrMemory(path) ? sectionSpan(path) : static_cast<unsigned int>(HkFile::getsize_noopen(path));
}
