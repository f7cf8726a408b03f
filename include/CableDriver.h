/// @file
/// The drivers of USB programming cables: whether a cable is there, the update of its driver, and the restart of the
/// system that an update may need.
#pragma once

#include "TessalExport.h"

/// One pattern for the ids of devices.
struct DeviceIdPattern {
    const char* m_text;           ///< the pattern behind its prefixes, in the text that was parsed
    const char* m_firstWildcard;  ///< the first `*` in m_text; null when the pattern stands literally
    int m_isInstanceId;           ///< not 0: meant for the instance id, and not for hardware and compatible ids
};

/// Takes the prefixes off a pattern: a `@` at its front marks it as one for instance ids; a `'` behind that makes the
/// rest literal; otherwise each `*` in it stands for any run of characters. Null is the empty text.
/// @return a pattern that points into @p text
TESSAL_API DeviceIdPattern parseDeviceIdPattern(const char* text);

/// True when the whole text matches the pattern; ASCII letters match in either case. Takes at most length of text
/// times length of pattern steps. Null is the empty text.
TESSAL_API bool matchDeviceId(const char* text, const DeviceIdPattern& pattern);

/// True when a programming cable is present: a device of the cables' class whose description is "Zarnex USB Cable" or
/// "Zarnex Hexlink Cable USB", in any case. A failure of the host is printed on standard output. Always false on a host
/// without a device installer, such as Linux.
TESSAL_API bool isProgCableClassPresent();

/// Brings the driver of a set-up file to the cables of a hardware id: registers a device of that id, updates the
/// driver of all such devices, and removes those that are present, so that they come up again with the new driver. What
/// fails in the first two steps is passed over in silence, and so is a device that cannot be removed.
/// @param infPath the set-up file; each `/` in it is replaced by `\`, in place
/// @param hardwareId an id. For the removal it is a pattern: `*` alone removes every device, `=` and a class
/// name every device of that class
/// @return 0: done, also when there was no device; 1: done, and a device needs a restart of the system, see Reboot();
/// 2: a call of the host failed, or there is no device installer, as on Linux
TESSAL_API int updateHexlinkCableUSBFirmware(char* infPath, const char* hardwareId);

/// Asks the user twice and, when both answers are yes, restarts the system at once. A restart that fails is printed on
/// standard output. On a host such as Linux it asks nobody and does nothing, unless a SystemRestarter is set.
TESSAL_API void Reboot();

/// What Reboot() asks and does in place of the host's own dialogues and restart.
class TESSAL_API SystemRestarter {
public:
    virtual ~SystemRestarter() = default;
    /// Puts a question to the user: true for yes. Asked once for each of the two questions, as long as the answer is
    /// yes.
    virtual bool confirm(const char* text, const char* title) = 0;
    /// Restarts the system or arranges for that: true when it will happen.
    virtual bool restart() = 0;
};

/// Sets what Reboot() uses, on either host; null restores the host's own. The object stays the caller's, and outlives
/// its use. Not while Reboot() runs.
TESSAL_API void setSystemRestarter(SystemRestarter* restarter);
