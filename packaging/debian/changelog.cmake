# brimol_debian_changelog(<variable>): CHANGELOG.md in the form of a Debian package's changelog.
# CHANGELOG.md has sections `## <version>, <date>` with points that begin with `- ` and go on with two
# blanks.
function(brimol_debian_changelog variable)
  file(STRINGS "${PROJECT_SOURCE_DIR}/CHANGELOG.md" lines)
  set(text "")
  set(end "")
  foreach(line IN LISTS lines)
    if(line MATCHES "^## ([0-9.]+), ([0-9-]+)$")
      string(APPEND text "${end}")
      set(version "${CMAKE_MATCH_1}")
      execute_process(
        COMMAND "${CMAKE_COMMAND}" -E env LC_ALL=C date --utc --rfc-email "--date=${CMAKE_MATCH_2}"
        OUTPUT_VARIABLE day OUTPUT_STRIP_TRAILING_WHITESPACE COMMAND_ERROR_IS_FATAL ANY)
      string(APPEND text "brimol3-widget (${version}-${release}) unstable; urgency=medium\n\n")
      set(end "\n -- ${BRIMOL_PACKAGE_MAINTAINER}  ${day}\n\n")
    elseif(line MATCHES "^- (.*)$" AND end)
      string(APPEND text "  * ${CMAKE_MATCH_1}\n")
    elseif(line MATCHES "^  (.*)$" AND end)
      string(APPEND text "    ${CMAKE_MATCH_1}\n")
    endif()
  endforeach()
  set(${variable} "${text}${end}" PARENT_SCOPE)
endfunction()
