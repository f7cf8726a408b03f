/// @file
/// Brings every public class of the library.
#pragma once

// One line a header, sorted.
#include "Access.h"
#include "DebugTrace.h"
#include "HkEnv.h"
#include "HkException.h"
#include "HkMessageManager.h"
#include "HkStr.h"
#include "HkStream.h"
#include "HkString.h"
#include "TessalException.h"
#include "TessalExport.h"
