/// @file
/// Brings every public class of the library.
#pragma once

// One line a header, sorted.
#include "AcdReader.h"
#include "DataPath.h"
#include "CableInfo.h"
#include "DebugTrace.h"
#include "FileUtility.h"
#include "HkDir.h"
#include "HkEnv.h"
#include "HkException.h"
#include "HkFile.h"
#include "HkMemory.h"
#include "HkMessageManager.h"
#include "HkPath.h"
#include "HkStr.h"
#include "HkStream.h"
#include "HkString.h"
#include "ProfileConfig.h"
#include "ProfileKeyTable.h"
#include "NetString.h"
#include "Streamable.h"
#include "TessalException.h"
#include "TessalExport.h"
#include "TessalSmokeMgr.h"
