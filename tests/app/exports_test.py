"""Exports and report, as programs that are not ours read them.

exports_test.py STATION FACTORY_TEST SCHEMA_FOLDER XMLLINT JUNIT_XSD CHROMEDRIVER
"""

import base64
import csv
import io
import json
import os
import pathlib
import resource
import subprocess
import sys
import tempfile
import unittest

import jsonschema
import junitparser

from browser import LOW_CONTRAST, NAMELESS, Browser

STATION, FACTORY_TEST, SCHEMAS, XMLLINT, JUNIT_XSD, CHROMEDRIVER = sys.argv[1:]
UNITS, TESTS = 12, 3
SERIAL = "=s-3"
PAINTED = """
return [...document.querySelectorAll("svg")].filter((plot) => !plot.getAttribute("aria-label") ||
    plot.getBoundingClientRect().width < 50 || !plot.querySelector("path, rect")).length;
"""


class ExportsTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.folder = pathlib.Path(cls.enterClassContext(tempfile.TemporaryDirectory()))
        cls.store = cls.folder / "station.db"
        subprocess.run([STATION, cls.store, "s", str(UNITS), str(TESTS)], check=True, stdout=subprocess.DEVNULL)
        cls.browser = cls.enterClassContext(Browser(CHROMEDRIVER))

    def program(self, *arguments):
        return subprocess.run([FACTORY_TEST, *arguments], check=False, capture_output=True, text=True)

    def export(self, *options):
        out = self.program(*options, "--database", self.store)
        self.assertEqual((0, ""), (out.returncode, out.stderr))
        return out.stdout

    def validate(self, name, document):
        schemas = {file: json.loads(pathlib.Path(SCHEMAS, f"{file}.schema.json").read_text())
                   for file in ("history", "results")}
        schema = schemas[name]
        named = {each["$id"]: each for each in schemas.values()}
        jsonschema.Draft202012Validator.check_schema(schema)
        resolver = jsonschema.RefResolver.from_schema(schema, store=named)
        jsonschema.Draft202012Validator(schema, resolver=resolver).validate(document)

    def test_json_fits_its_schema(self):
        document = json.loads(self.export("export", "--json"))
        self.validate("history", document)
        self.assertEqual(UNITS, len(document["runs"]))
        self.assertEqual({TESTS}, {len(run["results"]) for run in document["runs"]})
        document["runs"][0]["results"][0]["values"][0]["value"] = "1"
        with self.assertRaises(jsonschema.ValidationError):
            self.validate("history", document)
        one = json.loads(self.export("export", "--json", f"--serial={SERIAL}", "--since=2026-11-24"))["runs"]
        self.assertEqual([SERIAL], [run["unit"] for run in one])
        self.assertEqual([], json.loads(self.export("export", "--json", "--since", "2026-11-26"))["runs"])

    def test_results_file_fits_its_schema(self):
        results = self.folder / "results.json"
        trace = self.folder / "short.trace"
        trace.write_text("brimol-trace 1\nwait 10\n")
        out = subprocess.run([FACTORY_TEST, "--headless", "--results", results], check=False,
                             env=os.environ | {"BRIMOL_TRACE": str(trace)})
        self.assertEqual(4, out.returncode)
        written_at = results.stat().st_mtime_ns, results.stat().st_ino
        self.program("--headless", "--results", results, "--shot", self.folder / "menu.png")
        self.assertEqual(written_at, (results.stat().st_mtime_ns, results.stat().st_ino), "a picture keeps nothing")
        written = json.loads(results.read_text())
        self.validate("results", written)
        self.assertEqual(("Default", 64), (written["plan"]["name"], len(written["plan"]["hash"])))
        run = json.loads(self.export("export", "--json"))["runs"][0]
        for result in run["results"]:
            del result["id"]
        self.validate("results", {"version": 2, "unit": run["unit"], "results": run["results"]})

    def test_results_files_are_judged_alike(self):
        """By the schema and by the program."""
        result = {"test": "a", "verdict": "PASS", "started": "2026-11-21T07:00:00Z", "duration_ms": 1,
                  "screen": {"width": 1, "height": 2}}
        good = [{}, {"version": 1}, {"version": 2, "more": 1}, {"state": "finished"}], [
            {"more": 1}, {"reason": "retry", "attempt": 2}]
        bad = [{"version": 0}, {"version": 3}, {"unit": 7}, {"plan": {"name": "x"}}, {"state": "running"}], [
            {"test": 7}, {"verdict": "pass"}, {"attempt": 0}, {"duration_ms": -1}, {"screen": {"width": 1}},
            {"values": [{"name": "a"}]}, {"reason": "x"}, {"reason": ""}, {"started": "now"}]
        file = self.folder / "judged.json"
        for code, (of_files, of_results) in ((0, good), (1, bad)):
            for document in [{"results": [result]} | each for each in of_files] + [
                    {"results": [result | each]} for each in of_results]:
                with self.subTest(document):
                    file.write_text(json.dumps(document))
                    out = self.program("--headless", "--new-run", "--results", file, "--shot", self.folder / "a.png")
                    self.assertEqual(code, out.returncode, out.stderr)
                    if code == 0:
                        self.validate("results", document)
                    else:
                        self.assertRaises(jsonschema.ValidationError, self.validate, "results", document)

    def test_junit_fits_its_schema(self):
        file = self.folder / "junit.xml"
        self.assertEqual("", self.export("export", "--junit", "--output", file))
        subprocess.run([XMLLINT, "--noout", "--schema", JUNIT_XSD, file], check=True, stderr=subprocess.DEVNULL)
        suites = junitparser.JUnitXml.fromfile(str(file))
        self.assertEqual((UNITS, UNITS * TESTS), (len(list(suites)), sum(len(list(suite)) for suite in suites)))
        fails = sum(isinstance(what, junitparser.Failure) for suite in suites for case in suite for what in case.result)
        runs = json.loads(self.export("export", "--json"))["runs"]
        self.assertEqual(sum(result["verdict"] == "FAIL" for run in runs for result in run["results"]), fails)
        text = file.read_text()
        self.assertEqual(UNITS, text.count("<testsuite "))
        self.assertIn("worst distance", text)
        self.assertIn('<failure message="time-out"/>', text)
        self.assertEqual(UNITS, text.count('<property name="plan_hash" value="h3"/>'))

    def test_csv_has_a_line_for_each_value(self):
        rows = list(csv.DictReader(io.StringIO(self.export("export", "--csv"), newline=""), strict=True))
        self.assertEqual(UNITS * TESTS * 2, len(rows))
        self.assertEqual({"'=s-0"}, {row["unit"] for row in rows[:TESTS * 2]}, "no formula for a spreadsheet")
        self.assertEqual({"7"}, {row["value"] for row in rows if row["value_name"] == "<i>hits</i>"})
        self.assertNotIn(None, rows[0].values())
        self.assertEqual({("PASS", ""), ("FAIL", "time-out")}, {(row["verdict"], row["reason"]) for row in rows})

    def test_pages_stand_alone_in_a_browser(self):
        for name, options in (("runs", ["export", "--html"]), ("report", ["report"])):
            file = self.folder / f"{name}.html"
            self.export(*options, "--output", file)
            grounds = set()
            for scheme in ("light", "dark"):
                with self.subTest(name, scheme=scheme):
                    grounds.add(self.look_at(file, scheme))
            self.assertEqual(2, len(grounds))
        self.assertGreater(self.browser.run("return document.querySelectorAll('svg').length"), 4)
        pdf = base64.b64decode(self.browser.devtools("Page.printToPDF", printBackground=True)["data"])
        self.assertTrue(pdf.startswith(b"%PDF") and len(pdf) > 20000)

    def look_at(self, file, scheme):
        self.browser.resize(1000, 900)
        self.browser.prefer(scheme)
        self.browser.fetched()
        self.browser.open(file.as_uri())
        self.assertEqual([file.as_uri()], [url for url in self.browser.fetched() if not url.startswith("data:")])
        self.assertEqual([], self.browser.log("browser"))
        self.assertEqual([], self.browser.run(LOW_CONTRAST))
        self.assertEqual([], self.browser.run(NAMELESS))
        self.assertEqual(0, self.browser.run(PAINTED))
        self.assertEqual(0, self.browser.run("return document.querySelectorAll('main img, main i, script').length"))
        self.assertLessEqual(self.browser.run("return document.documentElement.scrollWidth"), 1000)
        return self.browser.run("return getComputedStyle(document.body).backgroundColor")

    def test_report_of_one_value(self):
        page = self.export("report", "--value", "worst distance")
        self.assertIn("worst distance", page)
        self.assertNotIn("hits", page)
        for word in ("--value", "--serial"):
            out = self.program("report", word, "unknown", "--database", self.store)
            self.assertEqual((0, 1), (out.returncode, out.stderr.count("unknown\n")))
            self.assertIn("There are none.", out.stdout)
        self.assertIn("none yet", self.export("report", "--since", "2030-01-01"))

    def test_full_disks_lose_nothing_that_was_there(self):
        old = self.folder / "old.txt"
        old.write_text("{}" + " " * 9000)
        results = self.folder / "old.json"
        document = json.loads(self.export("export", "--json"))["runs"][0]
        for result in document["results"]:
            del result["id"]
        results.write_text(json.dumps({"version": 2, "results": document["results"]}))
        verdicts = self.export("export", "--csv")
        screen = ("--headless",)
        with open("/dev/full", "w", encoding="ascii") as full:
            for most, arguments, where, says in [
                    (1 << 20, ["export", "--json", "--database", self.store], full, "stdout cannot be written"),
                    (1 << 20, ["report", "--database", self.store, "--output", "/dev/full"], None, "not a regular file"),
                    (33000, ["export", "--json", "--database", self.store, "--output", old], None,
                     f"{old}: cannot be written: the file would be too large"),
                    (64, [*screen, "--new-run", "--results", results], None, f"{results}: cannot be written: the file would be too large"),
                    (4096, [*screen, "--serial", "x", "--database", self.store], None,
                     f"{self.store}: cannot be read or written: the file would be too large"),
            ]:
                with self.subTest(arguments):
                    before = old.read_bytes(), results.read_bytes()
                    out = subprocess.run(
                        [FACTORY_TEST, *arguments], check=False, stdout=where, stderr=subprocess.PIPE, text=True,
                        preexec_fn=lambda: resource.setrlimit(resource.RLIMIT_FSIZE, (most, most)))
                    self.assertEqual((1, 1), (out.returncode, out.stderr.count("\n")), out.stderr)
                    self.assertIn(says, out.stderr)
                    self.assertEqual(before, (old.read_bytes(), results.read_bytes()))
        self.assertEqual(verdicts, self.export("export", "--csv"))

    def test_wrong_use_and_what_cannot_be_read(self):
        store = ("--database", str(self.store))
        (self.folder / "empty.db").touch()
        for arguments, code, says in [
                (["export", "--json"], 2, "needs one of --database"),
                (["export", *store], 2, "needs one of --json"),
                (["export", "--json", *store, "--line", "postgresql://x"], 2, "needs one of --database"),
                (["export", "--json", "--csv", *store], 2, "takes only one of --json"),
                (["report", "--json", *store], 2, "unknown option '--json'"),
                (["report", "--database"], 2, "--database needs a value"),
                (["report", "--since", "2026-02-30", *store], 2, "--since needs a day"),
                (["export", "--csv", "--value", "x", *store], 2, "takes no --value"),
                (["report", "--line", "x"], 2, "--line needs an address"),
                (["report", "--database", "/none.db"], 1, "/none.db: cannot be opened: it or its folder is missing"),
                (["report", "--database", __file__], 1, "is not a database"),
                (["report", "--database", self.folder / "empty.db"], 1, "holds no factory test's records"),
                (["report", *store, "--output", "/none/x"], 1, "/none/x: cannot be written: it or its folder is missing"),
        ]:
            with self.subTest(arguments):
                out = self.program(*arguments)
                self.assertEqual((code, "", 1), (out.returncode, out.stdout, out.stderr.count("\n")))
                self.assertIn(says, out.stderr)


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
