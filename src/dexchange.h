#pragma once

// Umbrella header of libdexchange: every public header.

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynArray.h"
#include "hostlibs/VynLogging.h"
#include "hostlibs/VynString.h"
#include "hostlibs/winport.h"
#include "ieDefinitions/IEResult.h"
#include "ieUtils/IEAsciiFields.h"
#include "ieUtils/IEUtils.h"
#include "ieUtils/IEUtilsBlocks.h"
#include "ieUtils/IEUtilsCodePages.h"
#include "ieUtils/IEUtilsFiles.h"
#include "ieUtils/IEUtilsNames.h"
#include "ieUtils/IEUtilsParsers.h"
#include "ieUtils/IEUtilsStringArray.h"
#include "ieUtils/IEVersion.h"
