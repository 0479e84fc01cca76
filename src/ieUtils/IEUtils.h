#pragma once

// The toolbox that the format plug-ins share: text parsing, name rules, block records, code-page
// conversions, colours, file names and folder listings, report columns.

#include "ieUtils/IEUtilsBlocks.h"
#include "ieUtils/IEUtilsCodePages.h"
#include "ieUtils/IEUtilsFiles.h"
#include "ieUtils/IEUtilsNames.h"
#include "ieUtils/IEUtilsParsers.h"
#include "ieUtils/IEUtilsStringArray.h"
