# What makes faults in a library harder to misuse, where the compiler has it.

include(CheckCXXCompilerFlag)

# brimol_harden(<target>): compiles the target with checks of buffers and of the stack, and links it so that
# nothing of it is both writable and executable. Sanitizers have checks of their own, which these would hide.
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
  target_link_options(
    ${target} PRIVATE LINKER:-z,relro LINKER:-z,now LINKER:-z,noexecstack LINKER:-z,text
                      "$<$<STREQUAL:$<TARGET_PROPERTY:TYPE>,EXECUTABLE>:SHELL:-fPIE -pie>")
endfunction()

# brimol_harden_all(): every library and program that the project has by now.
function(brimol_harden_all)
  brimol_targets_below("${PROJECT_SOURCE_DIR}" targets)
  foreach(target IN LISTS targets)
    get_target_property(type ${target} TYPE)
    if(type MATCHES "_LIBRARY$|^EXECUTABLE$" AND NOT type STREQUAL "INTERFACE_LIBRARY")
      brimol_harden(${target})
    endif()
  endforeach()
endfunction()
