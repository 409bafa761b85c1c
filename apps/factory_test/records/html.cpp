#include "records/html.h"

#include "xml/xml_text.h"

namespace factory_test {

namespace {

constexpr std::string_view kStyle = R"css(
:root {
  color-scheme: light dark;
  --ground: #f4f5f7; --card: #ffffff; --line: #dfe3e8; --text: #1c2128; --quiet: #57606a;
  --accent: #0b5cad; --second: #7a3e9d; --good: #17693a; --bad: #b3261e; --well: #e6ebf1;
}
@media (prefers-color-scheme: dark) {
  :root {
    --ground: #0f1217; --card: #171b22; --line: #2a313b; --text: #e4e8ee; --quiet: #9da8b5;
    --accent: #82b8ff; --second: #d6a8f0; --good: #6fcf97; --bad: #ff9a90; --well: #232b36;
  }
}
* { box-sizing: border-box; }
body {
  margin: 0 auto; max-width: 72rem; padding: 2rem 1.5rem 4rem; overflow-wrap: anywhere;
  background: var(--ground); color: var(--text);
  font: 0.9375rem/1.5 system-ui, "Segoe UI", Roboto, "Noto Sans", sans-serif;
}
h1 { font-size: 1.375rem; margin: 0; }
h2 { font-size: 1.0625rem; margin: 2.5rem 0 0.75rem; }
h3 { font-size: 0.9375rem; margin: 0 0 0.25rem; }
p { margin: 0.25rem 0; }
.quiet, caption, th, dt { color: var(--quiet); }
.facts { display: grid; grid-template-columns: repeat(auto-fit, minmax(9rem, 1fr)); gap: 0.75rem; margin: 1rem 0 0; }
.facts div, .card { background: var(--card); border: 1px solid var(--line); border-radius: 8px; padding: 0.75rem 1rem; }
.facts dd { margin: 0; font-size: 1.25rem; font-weight: 650; font-variant-numeric: tabular-nums; }
.card { margin-bottom: 0.75rem; overflow-x: auto; }
.plots { display: grid; grid-template-columns: repeat(auto-fit, minmax(min(100%, 26rem), 1fr)); gap: 1rem; }
figure { margin: 0.5rem 0 0; }
figcaption { color: var(--quiet); font-size: 0.8125rem; }
table { border-collapse: collapse; width: 100%; font-variant-numeric: tabular-nums; }
th, td { text-align: left; padding: 0.25rem 0.75rem 0.25rem 0; border-bottom: 1px solid var(--line); vertical-align: top; }
th, td { overflow-wrap: break-word; }
th { font-weight: 600; font-size: 0.8125rem; white-space: nowrap; }
.PASS { color: var(--good); font-weight: 650; }
.FAIL { color: var(--bad); font-weight: 650; }
svg { display: block; width: 100%; height: auto; }
figure svg { max-width: 40rem; }
svg text { fill: var(--quiet); font: 12px system-ui, Roboto, "Noto Sans", sans-serif; }
.axis { stroke: var(--line); fill: none; }
.first { stroke: var(--accent); fill: none; stroke-width: 2; }
.second { stroke: var(--second); fill: none; stroke-width: 2; stroke-dasharray: 6 3; }
.dots { stroke: var(--accent); fill: none; stroke-width: 5; stroke-linecap: round; }
.spread { stroke: var(--accent); fill: none; stroke-width: 1; opacity: 0.6; }
.bar { fill: var(--accent); }
.limit { stroke: var(--bad); fill: none; stroke-width: 1.5; stroke-dasharray: 4 3; }
.key1 { color: var(--accent); font-weight: 650; }
.key2 { color: var(--second); font-weight: 650; }
@media print {
  :root {
    --ground: #ffffff; --card: #ffffff; --line: #bbbbbb; --text: #000000; --quiet: #444444;
    --accent: #0b5cad; --second: #7a3e9d; --good: #17693a; --bad: #b3261e; --well: #eeeeee;
  }
  body { max-width: none; padding: 0; font-size: 10pt; }
  .card, figure, tr { break-inside: avoid; }
  h2, h3 { break-after: avoid; }
}
)css";

}  // namespace

std::string htmlText(std::string_view text) { return brimol::xml::escaped(text); }

std::string htmlPage(std::string_view title, std::string_view body) {
  std::string page = R"(<!DOCTYPE html>
<html lang="en">
<head>
<meta charset="utf-8">
<meta name="viewport" content="width=device-width, initial-scale=1">
<meta http-equiv="Content-Security-Policy" content="default-src 'none'; img-src data:; style-src 'unsafe-inline'">
<link rel="icon" href="data:,">
<title>)";
  page.append(htmlText(title)).append("</title>\n<style>").append(kStyle);
  page.append("</style>\n</head>\n<body>\n<main>\n<h1>").append(htmlText(title)).append("</h1>\n");
  return page.append(body).append("</main>\n</body>\n</html>\n");
}

std::string htmlRow(std::initializer_list<std::string> cells) {
  std::string row = "<tr>";
  for (const std::string& cell : cells) row.append("<td>").append(cell).append("</td>");
  return row.append("</tr>\n");
}

std::string htmlHead(std::initializer_list<const char*> names) {
  std::string row = "<tr>";
  for (const char* const name : names) {
    row.append("<th scope=\"col\">").append(name).append("</th>");
  }
  return row.append("</tr>\n");
}

std::string htmlVerdict(std::string_view word) {
  return std::string("<span class=\"").append(word).append("\">").append(word).append("</span>");
}

}  // namespace factory_test
