"""Holds plan files against the schema and against the program: both must say the same of each."""

import json
import pathlib
import re
import subprocess
import sys
import tempfile

import jsonschema

program, schema_file, folder = sys.argv[1:]
schema = json.loads(pathlib.Path(schema_file).read_text())
jsonschema.Draft202012Validator.check_schema(schema)
validator = jsonschema.Draft202012Validator(schema)
tests = schema["$defs"]["step"]["properties"]["test"]["enum"]
faults = []


def fits_schema(text):
    try:
        return validator.is_valid(json.loads(text))
    except json.JSONDecodeError:
        return False


def printed(*arguments):
    """What the program prints of a plan, or else why it refuses it."""
    run = subprocess.run([program, *arguments, "--print-plan"], capture_output=True, text=True)
    if run.returncode not in (0, 2):
        faults.append(f"{arguments}: exit code {run.returncode}")
    return (run.stdout, None) if run.returncode == 0 else (None, run.stderr)


def check(file, in_schema, in_program):
    text = file.read_text()
    if fits_schema(text) != in_schema:
        faults.append(f"{file.name}: the schema says {not in_schema}")
    plan, error = printed("--plan", str(file))
    if (plan is not None) != in_program:
        faults.append(f"{file.name}: the program says {error or 'it is right'}")
    elif plan is None and not re.fullmatch(
        rf"factory_test: {re.escape(str(file))}:\d+: .+\n", error
    ):
        faults.append(f"{file.name}: names no line: {error}")
    return plan, error


def check_again(plan):
    """A printed plan is right, and is printed the same."""
    copy = scratch / "printed.json"
    copy.write_text(plan)
    if check(copy, True, True)[0] != plan:
        faults.append(f"another plan when it is read again: {plan}")


def check_step(step, is_right):
    """A plan of one step; why it is refused."""
    file = scratch / (re.sub(r"\W+", "_", json.dumps(step)) + ".json")
    file.write_text(json.dumps({"version": 1, "name": "x", "steps": [step]}))
    return check(file, is_right, is_right)[1] or ""


def listed(error):
    return set(re.split(r", ", error.split("it has: ")[-1].strip())) - {"none"}


def check_test(test, limits, parameters):
    """The schema's names and ranges for a test are the program's."""
    if listed(check_step({"test": test, "limits": {"?": {"most": 1}}}, False)) != set(limits):
        faults.append(f"{test}: has other values")
    if listed(check_step({"test": test, "parameters": {"?": 1}}, False)) != set(parameters):
        faults.append(f"{test}: has other parameters")
    for name, of in parameters.items():
        for value in (of["minimum"], of["maximum"], of["minimum"] - 1, of["maximum"] + 1):
            is_right = of["minimum"] <= value <= of["maximum"]
            check_step({"test": test, "parameters": {name: value}}, is_right)
        half = of["minimum"] + 0.5
        check_step({"test": test, "parameters": {name: half}}, of.get("type") != "integer")


with tempfile.TemporaryDirectory() as name:
    scratch = pathlib.Path(name)
    counts = {}
    for kind, in_schema, in_program in (
        ("good", True, True),
        ("bad", False, False),
        ("beyond", True, False),  # what a schema cannot say
    ):
        files = sorted(pathlib.Path(folder, kind).glob("*.json"))
        counts[kind] = len(files)
        for file in files:
            plan, _ = check(file, in_schema, in_program)
            if plan:
                check_again(plan)
    check_again(printed()[0])
    known = check_step({"test": "?"}, False).split("known are:")[-1].split()
    if sorted(known) != sorted(tests):
        faults.append(f"the program's tests are not the schema's: {set(known) ^ set(tests)}")
    for rule in schema["$defs"]["step"]["allOf"]:
        test, of = rule["if"]["properties"]["test"], rule["then"]["properties"]
        if "const" in test:
            check_test(
                test["const"], of["limits"]["properties"], of["parameters"]["properties"]
            )

print("\n".join(faults) or f"files that both say the same of: {counts}")
sys.exit(1 if faults or min(counts.values()) == 0 else 0)
