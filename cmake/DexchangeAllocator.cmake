# The allocator of the model's blocks (src/hostlibs/VynAlloc.cpp): mimalloc through its own calls, or
# the C library's malloc. The sanitizers must see every block, so their builds use malloc.
if(DEXCHANGE_SANITIZE OR DEXCHANGE_TSAN OR DEXCHANGE_FUZZ)
  set(dexchange_allocator malloc)
else()
  set(dexchange_allocator "${DEXCHANGE_ALLOCATOR}")
endif()

if(dexchange_allocator STREQUAL "mimalloc")
  find_path(MIMALLOC_INCLUDE_DIR mimalloc.h)
  find_library(MIMALLOC_LIBRARY NAMES mimalloc)
  if(NOT MIMALLOC_INCLUDE_DIR OR NOT MIMALLOC_LIBRARY)
    message(FATAL_ERROR "mimalloc not found: run scripts/deps.sh (libmimalloc-dev), "
      "or configure with -DDEXCHANGE_ALLOCATOR=malloc")
  endif()
  # Linked by its path: hosts link libdexchange.so alone, so the exported package names no target.
  # Debian's libmimalloc.so also defines malloc and operator new, and the library calls only its mi_
  # functions. malloc always resolves to the C library, which every program depends on; the C++
  # runtime comes before mimalloc in the library's dependencies, so that operator new resolves to it
  # even in a program that loads the library with dlopen and does not depend on the C++ runtime.
  target_include_directories(dexchange SYSTEM PRIVATE "${MIMALLOC_INCLUDE_DIR}")
  target_link_libraries(dexchange PRIVATE stdc++ "${MIMALLOC_LIBRARY}")
  target_compile_definitions(dexchange PRIVATE DEXCHANGE_WITH_MIMALLOC=1)
elseif(NOT dexchange_allocator STREQUAL "malloc")
  message(FATAL_ERROR "DEXCHANGE_ALLOCATOR must be mimalloc or malloc, not '${dexchange_allocator}'")
endif()
message(STATUS "dexchange: model blocks from ${dexchange_allocator}")
