/// @file
/// Brings every public class of the library.
#pragma once

// One line a header, sorted.
#include "AcdReader.h"
#include "DataPath.h"
#include "DebugTrace.h"
#include "DeviceOptionsMgr.h"
#include "HkEnv.h"
#include "HkException.h"
#include "HkMessageManager.h"
#include "HkStr.h"
#include "HkStream.h"
#include "HkString.h"
#include "ModeOption.h"
#include "ModeOptionsMgr.h"
#include "OptionsMgr.h"
#include "Preference.h"
#include "ProgramOption.h"
#include "ProfileConfig.h"
#include "ProfileKeyTable.h"
#include "TessalException.h"
#include "TessalExport.h"
