# Strict warnings for our own targets only; third-party headers stay untouched.
add_library(dexchange_flags INTERFACE)
target_compile_options(dexchange_flags INTERFACE -Wall -Wextra -Wpedantic)
if(DEXCHANGE_WERROR)
  target_compile_options(dexchange_flags INTERFACE -Werror)
endif()

if(DEXCHANGE_SANITIZE)
  set(DEXCHANGE_SANITIZER_FLAGS -fsanitize=address,undefined -fno-omit-frame-pointer -fno-sanitize-recover=undefined)
  add_compile_options(${DEXCHANGE_SANITIZER_FLAGS})
  add_link_options(${DEXCHANGE_SANITIZER_FLAGS})
endif()
