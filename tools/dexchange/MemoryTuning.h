#pragma once

namespace dexchange_tool {

// A large import spends most of its time faulting in fresh 4 KiB pages of the model. glibc backs its
// heap with transparent huge pages, and serves the worker threads from the main arena, only when the
// environment asks for it at start, so the tool asks for it and starts itself once more. Nothing
// happens when GLIBC_TUNABLES is already in the environment (set it, even empty, to keep the defaults),
// and the tool runs on as it is when it cannot start again.
void restartWithMemoryTuning(char** argv);

}  // namespace dexchange_tool
