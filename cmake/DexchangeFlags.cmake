# Strict warnings for our own targets only; third-party headers stay untouched.
add_library(dexchange_flags INTERFACE)
target_compile_options(dexchange_flags INTERFACE -Wall -Wextra -Wpedantic)
if(DEXCHANGE_WERROR)
  target_compile_options(dexchange_flags INTERFACE -Werror)
endif()

if(DEXCHANGE_SANITIZE AND DEXCHANGE_TSAN)
  message(FATAL_ERROR "DEXCHANGE_SANITIZE and DEXCHANGE_TSAN exclude each other: use two build folders")
endif()

if(DEXCHANGE_SANITIZE)
  set(DEXCHANGE_SANITIZER_FLAGS -fsanitize=address,undefined -fno-omit-frame-pointer -fno-sanitize-recover=undefined)
  add_compile_options(${DEXCHANGE_SANITIZER_FLAGS})
  add_link_options(${DEXCHANGE_SANITIZER_FLAGS})
endif()

# ThreadSanitizer, for the runs in worker threads (`make tsan`).
if(DEXCHANGE_TSAN)
  set(DEXCHANGE_TSAN_FLAGS -fsanitize=thread -fno-omit-frame-pointer)
  add_compile_options(${DEXCHANGE_TSAN_FLAGS})
  add_link_options(${DEXCHANGE_TSAN_FLAGS})
endif()

# Fuzzing instruments the whole library for coverage and runs it under the sanitizers; the fuzz
# programs themselves link libFuzzer (fuzz/CMakeLists.txt).
if(DEXCHANGE_FUZZ)
  if(NOT CMAKE_CXX_COMPILER_ID MATCHES "Clang")
    message(FATAL_ERROR "DEXCHANGE_FUZZ=ON needs clang: configure with -DCMAKE_CXX_COMPILER=clang++")
  endif()
  set(DEXCHANGE_FUZZ_FLAGS -fsanitize=fuzzer-no-link,address,undefined -fno-omit-frame-pointer
      -fno-sanitize-recover=undefined)
  add_compile_options(${DEXCHANGE_FUZZ_FLAGS})
  add_link_options(-fsanitize=address,undefined)
endif()
