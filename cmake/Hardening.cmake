# What makes faults in a library harder to misuse, where the compiler has it.

include(CheckCXXCompilerFlag)

# brimol_harden(<target>): compiles the target with checks of buffers and of the stack. Sanitizers have
# checks of their own, which these would hide.
function(brimol_harden target)
  if(BRIMOL_SANITIZE)
    return()
  endif()
  set(CMAKE_REQUIRED_FLAGS -Werror) # Clang only warns of what it does not have for a processor
  foreach(name IN ITEMS stack-protector-strong stack-clash-protection cf-protection)
    string(MAKE_C_IDENTIFIER "BRIMOL_HAS_${name}" known)
    check_cxx_compiler_flag(-f${name} ${known})
    if(${known})
      target_compile_options(${target} PRIVATE -f${name})
    endif()
  endforeach()
  target_compile_options(
    ${target} PRIVATE -Wformat -Werror=format-security
                      "$<$<NOT:$<CONFIG:Debug>>:SHELL:-U_FORTIFY_SOURCE -D_FORTIFY_SOURCE=2>")
endfunction()
