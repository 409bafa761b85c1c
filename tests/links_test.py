"""Links and pictures of the pages lead to files, and the index names every page: links_test.py ROOT"""
import pathlib
import re
import sys

root = pathlib.Path(sys.argv[1]).resolve()
wrong = []
linked = {}
for page in [*root.glob("*.md"), *root.glob("docs/*.md")]:
    words = re.sub(r"^```.*?^```", "", page.read_text(encoding="utf-8"), flags=re.DOTALL | re.MULTILINE)
    targets = re.findall(r"(?:\]\(|<img src=\")([^)\":#\s]+)", words)
    linked[page] = {(page.parent / target).resolve() for target in targets}
    wrong += [f"{page}: no {target}" for target in linked[page] if not target.exists()]
index = root / "docs/README.md"
wrong += [f"{index}: does not name {page}" for page in linked if page.resolve() not in linked[index] | {index}]
sys.exit("\n".join(wrong) or 0)
