# mw_flags: what every target of the project is built with.

add_library(mw_flags INTERFACE)
target_compile_features(mw_flags INTERFACE cxx_std_20 c_std_11)
# One precision for all machines: without this 32-bit x86 computes with numbers wider than they are stored.
include(CheckCXXSourceCompiles)
check_cxx_source_compiles(
  "#include <cfloat>\nstatic_assert(FLT_EVAL_METHOD == 0, \"\");\nint main() {}" BRIMOL_STORED_PRECISION)
if(NOT BRIMOL_STORED_PRECISION)
  target_compile_options(mw_flags INTERFACE -msse2 -mfpmath=sse)
endif()

# In a batch the compiler takes sources for headers.
if(BRIMOL_BATCHES)
  set(batch_options -Wno-shadow $<$<COMPILE_LANG_AND_ID:CXX,GNU>:-Wno-subobject-linkage>)
endif()
target_compile_options(
  mw_flags INTERFACE -Wall -Wextra -Wpedantic -Wconversion -Wshadow
                     $<$<BOOL:${BRIMOL_WERROR}>:-Werror>
                     ${batch_options})

if(BRIMOL_SANITIZE STREQUAL "address")
  set(sanitizers -fsanitize=address,undefined -fno-sanitize-recover=undefined)
elseif(BRIMOL_SANITIZE STREQUAL "thread")
  set(sanitizers -fsanitize=thread)
elseif(BRIMOL_SANITIZE STREQUAL "fuzzer")
  set(sanitizers -fsanitize=address,undefined,fuzzer-no-link -fno-sanitize-recover=undefined)
elseif(NOT BRIMOL_SANITIZE STREQUAL "")
  message(FATAL_ERROR "BRIMOL_SANITIZE is empty, address, thread or fuzzer")
endif()
target_compile_options(mw_flags INTERFACE ${sanitizers} $<$<BOOL:${BRIMOL_SANITIZE}>:-fno-omit-frame-pointer>)
target_link_options(mw_flags INTERFACE ${sanitizers})
