// The commands that set options and preferences.
#pragma once

#include <TessalUtility.h>

class Session;

/// Sets the options of the device operation that the command names and shows the arguments that they make.
DeviceOptionsMgr takeOptions(const HkCmdArgs& args);
/// The same, for an operation that is only checked.
bool showOptions(Session& session, const HkCmdArgs& args);
/// True where the preference is set to True.
bool isPreferred(TessalPreference::PREFERENCE row);
/// Lists the preferences, shows one or sets one.
bool preference(Session& session, const HkCmdArgs& args);
