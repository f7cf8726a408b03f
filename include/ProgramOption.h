/// @file
/// The rows of the device operations' options.
///
/// One row stands for one option: its enumerator, its kind (a Switch or a Text option), the text that stands for it on
/// a command line, and how many rows behind it form a group with it. Enumerator, key text and description all come
/// from here. The order is part of the interface: callers pass row numbers across the library's border.
#pragma once

#include <cstdint>
#include <iterator>

#include "OptionRow.h"

// clang-format off
#define TESSAL_PROGRAM_OPTIONS(ROW) \
    ROW(ERASE_B4_PROGRAMMING, Switch, "-e", 0)                             \
    ROW(VERIFY, Switch, "-v", 0)                                           \
    ROW(READ_PROTECT, Switch, "-r", 0)                                     \
    ROW(WRITE_PROTECT, Switch, "-w", 0)                                    \
    ROW(FUNCTION_TEST, Switch, "-t", 0)                                    \
    ROW(SKIP_USER_ARRAY, Switch, "", 0)                                    \
    ROW(LOAD_FPGA, Switch, "-loadfpga", 0)                                 \
    ROW(PARALLEL_MODE, Switch, "-parallel", 0)                             \
    ROW(USE_D4_4_CF, Switch, "-useD4", 0)                                  \
    ROW(USERCODE, Text, "-u", 0)                                           \
    ROW(UES, Text, "-ues", 0)                                              \
    ROW(SECURE_MODE, Switch, "-s", 0)                                      \
    ROW(PROGRAM_KEY, Text, "-key", 0)                                      \
    ROW(ON_THE_FLY_PROGRAMMING, Switch, "-otf", 0)                         \
    ROW(PULSE_PROG, Switch, "-prog", 0)                                    \
    ROW(SECTOR_PROTECT, Switch, "-sectorprotect", 0)                       \
    ROW(SECTOR_LOCKDOWN, Switch, "-sectorlockdown", 0)                     \
    ROW(PROGRAM_ONLYFPGA, Switch, "-onlyFpga", 0)                          \
    ROW(READ_PROTECT_NOBSCANTEST, Switch, "-nobscanreg", 0)                \
    ROW(OTP_SECURITY, Switch, "-otpsecurity", 0)                           \
    ROW(ASSERT_INIT, Switch, "-assertinit", 0)                             \
    ROW(DATA_WIDTH, Text, "-dataWidth", 0)                                 \
    ROW(RS_PIN1, Text, "-rs1", 0)                                          \
    ROW(RS_PIN0, Text, "-rs0", 0)                                          \
    ROW(CMGR_PROGRAM_MAX_OPTION, Switch, "", 0)                            \
    ROW(REV0_CHECKED, Switch, "-ver", 0)                                   \
    ROW(REV0_VALUE, Switch, "0", 6)                                        \
    ROW(REV0_RP, Switch, "rp", 0)                                          \
    ROW(REV0_WP, Switch, "wp", 0)                                          \
    ROW(REV0_ER, Switch, "erase", 0)                                       \
    ROW(REV0_VR, Switch, "verify", 0)                                      \
    ROW(REV0_FRC, Switch, "frc", 0)                                        \
    ROW(REV0_CUSTCODE, Text, "customercode:", 0)                           \
    ROW(REV1_CHECKED, Switch, "-ver", 0)                                   \
    ROW(REV1_VALUE, Switch, "1", 6)                                        \
    ROW(REV1_RP, Switch, "rp", 0)                                          \
    ROW(REV1_WP, Switch, "wp", 0)                                          \
    ROW(REV1_ER, Switch, "erase", 0)                                       \
    ROW(REV1_VR, Switch, "verify", 0)                                      \
    ROW(REV1_FRC, Switch, "frc", 0)                                        \
    ROW(REV1_CUSTCODE, Text, "customercode:", 0)                           \
    ROW(REV2_CHECKED, Switch, "-ver", 0)                                   \
    ROW(REV2_VALUE, Switch, "2", 6)                                        \
    ROW(REV2_RP, Switch, "rp", 0)                                          \
    ROW(REV2_WP, Switch, "wp", 0)                                          \
    ROW(REV2_ER, Switch, "erase", 0)                                       \
    ROW(REV2_VR, Switch, "verify", 0)                                      \
    ROW(REV2_FRC, Switch, "frc", 0)                                        \
    ROW(REV2_CUSTCODE, Text, "customercode:", 0)                           \
    ROW(REV3_CHECKED, Switch, "-ver", 0)                                   \
    ROW(REV3_VALUE, Switch, "3", 6)                                        \
    ROW(REV3_RP, Switch, "rp", 0)                                          \
    ROW(REV3_WP, Switch, "wp", 0)                                          \
    ROW(REV3_ER, Switch, "erase", 0)                                       \
    ROW(REV3_VR, Switch, "verify", 0)                                      \
    ROW(REV3_FRC, Switch, "frc", 0)                                        \
    ROW(REV3_CUSTCODE, Text, "customercode:", 0)                           \
    ROW(MASTER, Switch, "-master", 0)                                      \
    ROW(INTERNAL_CLOCK, Switch, "-internalClk", 0)                         \
    ROW(CLOCK_FREQUENCY, Switch, "-clkFreq", 0)                            \
    ROW(FREQ_20MHZ, Switch, "20", 0)                                       \
    ROW(FREQ_40MHZ, Switch, "40", 0)                                       \
    ROW(DEFAULT_REVISION, Text, "-defaultVersion", 0)                      \
    ROW(PROGRAM_KEYONLY, Switch, "-keyonly", 0)                            \
    ROW(PROGRAM_TURBO, Switch, "-turbo", 0)                                \
    ROW(INSYSTEM_UPDATE, Switch, "-inSystemUpdate", 0)                     \
    ROW(PROGRAM_REVISION_SELECT_ONLY, Switch, "-revisionSelectionOnly", 0) \
    ROW(PROGRAM_MAX_OPTIONS, Switch, "", 0)                                \
    ROW(ALL_CHECKED, Switch, "", 0)                                        \
    ROW(ERASE_OVERRIDE, Switch, "-o", 0)                                   \
    ROW(ERASE_REV0, Switch, "-ver", 0)                                     \
    ROW(ERASE_REV0_VALUE, Switch, "0", 0)                                  \
    ROW(ERASE_REV1, Switch, "-ver", 0)                                     \
    ROW(ERASE_REV1_VALUE, Switch, "1", 0)                                  \
    ROW(ERASE_REV2, Switch, "-ver", 0)                                     \
    ROW(ERASE_REV2_VALUE, Switch, "2", 0)                                  \
    ROW(ERASE_REV3, Switch, "-ver", 0)                                     \
    ROW(ERASE_REV3_VALUE, Switch, "3", 0)                                  \
    ROW(ERASE_ALL, Switch, "", 0)                                          \
    ROW(ERASE_TURBO, Switch, "-turbo", 0)                                  \
    ROW(ERASE_REVISION_SELECTION, Switch, "-revisionSelection", 0)         \
    ROW(ERASE_MAX_OPTIONS, Switch, "", 0)                                  \
    ROW(READBACK_FILE, Text, "-file", 0)                                   \
    ROW(READBACK_MAX_OPTIONS, Switch, "", 0)                               \
    ROW(VERIFY_REV0, Switch, "-ver", 0)                                    \
    ROW(VERIFY_REV0_VALUE, Switch, "0", 0)                                 \
    ROW(VERIFY_REV1, Switch, "-ver", 0)                                    \
    ROW(VERIFY_REV1_VALUE, Switch, "1", 0)                                 \
    ROW(VERIFY_REV2, Switch, "-ver", 0)                                    \
    ROW(VERIFY_REV2_VALUE, Switch, "2", 0)                                 \
    ROW(VERIFY_REV3, Switch, "-ver", 0)                                    \
    ROW(VERIFY_REV3_VALUE, Switch, "3", 0)                                 \
    ROW(VERIFY_ALL, Switch, "", 0)                                         \
    ROW(VERIFY_MAX_OPTIONS, Switch, "", 0)                                 \
    ROW(CUSTCODE_REV0, Switch, "-ver", 0)                                  \
    ROW(CUSTCODE_REV0_VALUE, Switch, "0", 0)                               \
    ROW(CUSTCODE_REV1, Switch, "-ver", 0)                                  \
    ROW(CUSTCODE_REV1_VALUE, Switch, "1", 0)                               \
    ROW(CUSTCODE_REV2, Switch, "-ver", 0)                                  \
    ROW(CUSTCODE_REV2_VALUE, Switch, "2", 0)                               \
    ROW(CUSTCODE_REV3, Switch, "-ver", 0)                                  \
    ROW(CUSTCODE_REV3_VALUE, Switch, "3", 0)                               \
    ROW(CUSTCODE_ALL, Switch, "", 0)                                       \
    ROW(CUSTCODE_MAX_OPTIONS, Switch, "", 0)                               \
    ROW(LOAD_REV, Text, "-ver", 0)
// clang-format on

namespace tESSALNS {

/// The options of the device operations; the value is the row, counted from 0.
enum PROGRAM_OPTION : std::int32_t {
#define TESSAL_ENUMERATOR(name, kind, dashValue, groupSize) name,
    TESSAL_PROGRAM_OPTIONS(TESSAL_ENUMERATOR)
#undef TESSAL_ENUMERATOR
};

/// The same rows, in the order of their enumerators.
inline constexpr OptionRow programOptionRows[] = {
#define TESSAL_ROW(name, kind, dashValue, groupSize) {"PROGRAM_OPTIONS/" #name, OptionKind::kind, dashValue, groupSize},
    TESSAL_PROGRAM_OPTIONS(TESSAL_ROW)
#undef TESSAL_ROW
};
static_assert(std::size(programOptionRows) == 105, "callers pass row numbers");

}  // namespace tESSALNS
