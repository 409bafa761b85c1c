# Puts the page's style and script into its template, and the template into a source file:
# cmake -DFOLDER=<of the page> -DOUTPUT=<source> -P embed.cmake
file(READ "${FOLDER}/report.html" page)
foreach(part style=report.css script=report.js)
  string(REGEX MATCH "^(.*)=(.*)$" all "${part}")
  set(mark "{{${CMAKE_MATCH_1}}}")
  file(READ "${FOLDER}/${CMAKE_MATCH_2}" text)
  string(REPLACE "${mark}" "${text}" page "${page}")
endforeach()
file(WRITE "${OUTPUT}" "#include \"embedded.h\"\n
namespace brimol::replay {\n
const std::string_view kReportTemplate = R\"PAGE(${page})PAGE\";\n
}  // namespace brimol::replay\n")
