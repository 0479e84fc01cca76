#pragma once

// The toolbox that the format plug-ins share: units and number texts, text parsing, name rules, natural
// names, block records, code-page conversions, colours, file names and folder listings, report columns,
// custom ASCII field lists, the text and XML readers, and geometry helpers.

#include "ieUtils/IEAsciiFields.h"
#include "ieUtils/IEFileReaders.h"
#include "ieUtils/IENaturalNames.h"
#include "ieUtils/IEUtilsBlocks.h"
#include "ieUtils/IEUtilsCodePages.h"
#include "ieUtils/IEUtilsCoords.h"
#include "ieUtils/IEUtilsFiles.h"
#include "ieUtils/IEUtilsGeometry.h"
#include "ieUtils/IEUtilsNames.h"
#include "ieUtils/IEUtilsParsers.h"
#include "ieUtils/IEUtilsStringArray.h"
#include "ieUtils/IEUtilsUnitWords.h"
#include "ieUtils/IEUtilsUnits.h"
