#pragma once

// Marks the classes and functions that libdexchange.so exports; everything else is built with hidden
// visibility. Plug-ins link against the same symbols, so the macro is the same on both sides.
#if defined(__GNUC__)
#define DEX_API __attribute__((visibility("default")))
#else
#define DEX_API
#endif
