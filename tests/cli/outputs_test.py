#!/usr/bin/env python3
"""arbolex-cli read as a script reads it: every command in every format.

- JSON: a strict parser takes it, and it validates against the command's
  schema in docs/schemas/ (JSON Schema draft 2020-12);
- TSV and CSV: every block (the lines between blank lines and "#" lines)
  has as many fields on every line, and both formats hold the same cells;
- the runner's `print flxMain` and `print flxSummary` after a thinning, its
  assortment rows and a final cut;
- the run record reproduces its run: a rotation, an optimisation and an
  uncertainty run again from their own "run" inputs give the same document,
  the time aside.

Run by CTest with ARBOLEX_CLI (the program), ARBOLEX_DATA_SOURCE (the
shipped data folder) and ARBOLEX_SCHEMAS (docs/schemas) in the environment;
the arguments name the test classes to run.
"""

import csv
import io
import json
import os
import pathlib
import re
import shutil
import subprocess
import tempfile
import unittest

import jsonschema

CLI = os.environ["ARBOLEX_CLI"]
DATA_SOURCE = pathlib.Path(os.environ["ARBOLEX_DATA_SOURCE"])
SCHEMAS = pathlib.Path(os.environ["ARBOLEX_SCHEMAS"])

STAND = "--model 0 --age 15 --stocking 2500 --height 7 --basal-area 20".split()
REGIME = "--thin-from 20 --thin-every 5 --thin-volume 40 --thin-until 35".split()
MONEY = "--rate 3 --establishment-cost 1500 --annual-cost 10".split()

# Each command as a user runs it, with the least work that still fills
# every part of its output.
COMMANDS = {
    "project": ["project", *STAND, "--to", "40", "--by", "5"],
    "thin": ["thin", "--model", "0", "--age", "30", "--stocking", "2000", "--height", "13",
             "--basal-area", "40", "--residual-volume", "200"],
    "grow": ["grow", *STAND, "--to", "40", "--by", "5"],
    "assort": ["assort", "--model", "0", "--age", "40", "--stocking", "900", "--height", "20",
               "--basal-area", "40"],
    "rotation": ["rotation", *STAND, *REGIME, *MONEY, "--valuation", "assortment",
                 "--carbon-price", "56", "--carbon-money", "units"],
    "optimise": ["optimise", *STAND, *REGIME, *MONEY, "--top", "3", "--objective", "carbon"],
    "uncertainty": ["uncertainty", *STAND, *REGIME, *MONEY, "--draws", "400", "--seed", "7",
                    "--rate-range", "2", "4", "--cost-spread", "0.1", "--carbon-price", "30"],
}

TIME = re.compile(rb'"started": ?"[^"]*"')


class DataFolder:
    """A copy of the shipped data folder, so that no run touches the sources."""

    def setUp(self):
        self.folder = tempfile.TemporaryDirectory()
        self.data = pathlib.Path(self.folder.name) / "data"
        shutil.copytree(DATA_SOURCE, self.data, ignore=shutil.ignore_patterns("examples"))
        self.work = pathlib.Path(self.folder.name)

    def tearDown(self):
        self.folder.cleanup()

    def run_cli(self, arguments, expected_status=0):
        done = subprocess.run([CLI, *arguments, "--data-dir", str(self.data)],
                              capture_output=True, cwd=self.work, timeout=120)
        self.assertEqual(done.returncode, expected_status,
                         f"{' '.join(arguments)}\n{done.stderr.decode()}")
        return done.stdout


def schema_validator(name):
    """The validator of docs/schemas/NAME.schema.json, its references to
    run.schema.json resolved from the folder."""
    store = {}
    for path in SCHEMAS.glob("*.schema.json"):
        store[path.as_uri()] = json.loads(path.read_text(encoding="utf-8"))
    uri = (SCHEMAS / f"{name}.schema.json").as_uri()
    schema = store[uri]
    jsonschema.Draft202012Validator.check_schema(schema)
    try:
        import referencing  # jsonschema 4.18 and later

        registry = referencing.Registry().with_resources(
            (u, referencing.Resource.from_contents(
                s, default_specification=referencing.jsonschema.DRAFT202012))
            for u, s in store.items())
        return jsonschema.Draft202012Validator({"$ref": uri}, registry=registry)
    except ImportError:
        resolver = jsonschema.RefResolver(base_uri=uri, referrer=schema, store=store)
        return jsonschema.Draft202012Validator(schema, resolver=resolver)


def strict_json(data):
    """The document as a strict reader takes it: UTF-8, no control character
    inside a string, no NaN."""

    def refuse(constant):
        raise ValueError(f"not JSON: {constant}")

    return json.loads(data.decode("utf-8"), parse_constant=refuse)


def figure_keys(value, found=None):
    """Every key whose value is a number, or a list of numbers."""
    found = set() if found is None else found
    if isinstance(value, dict):
        for key, member in value.items():
            numbers = member if isinstance(member, list) else [member]
            if any(isinstance(n, (int, float)) and not isinstance(n, bool) for n in numbers):
                found.add(key)
            figure_keys(member, found)
    elif isinstance(value, list):
        for element in value:
            figure_keys(element, found)
    return found


def blocks(rows):
    """The blocks of a table: runs of rows between blank lines and "#" lines."""
    block = []
    for row in rows:
        if not row or row == [""] or row[0].startswith("#"):
            if block:
                yield block
            block = []
        else:
            block.append(row)
    if block:
        yield block


def read_tsv(text):
    assert "\r" not in text, "a TSV line holds a carriage return"
    return [line.split("\t") for line in text.split("\n")[:-1]]


def read_csv(text):
    return list(csv.reader(io.StringIO(text, newline="")))


class TableChecks:
    def assertRectangular(self, rows, what):
        for block in blocks(rows):
            widths = {len(row) for row in block}
            self.assertEqual(len(widths), 1,
                             f"{what}: a block of {sorted(widths)} fields from {block[0]}")

    def assertCellsAre(self, header, lines, records, what):
        """Each line's cells are its JSON record's values: numbers as
        numbers, null as an empty cell."""
        self.assertEqual(len(lines), len(records), what)
        for line, record in zip(lines, records):
            for column, cell in zip(header, line):
                value = record[column]
                if isinstance(value, (int, float)):
                    self.assertEqual(float(cell), value, f"{what}.{column}")
                else:
                    self.assertEqual(cell, "" if value is None else value, f"{what}.{column}")


class SchemasTest(DataFolder, unittest.TestCase):
    """Every command's JSON parses strictly, validates and names its units."""

    def test_every_command_matches_its_schema(self):
        for name, arguments in COMMANDS.items():
            with self.subTest(command=name):
                document = strict_json(self.run_cli([*arguments, "--format", "json"]))
                schema_validator(name).validate(document)
                self.assertEqual(document["run"]["command"], name)
                # Every figure has its unit, wherever it stands.
                missing = figure_keys(document) - set(document["units"]) - {"units"}
                self.assertEqual(missing, set(), name)

    def test_a_schema_refuses_what_the_program_never_writes(self):
        document = strict_json(self.run_cli([*COMMANDS["rotation"], "--format", "json"]))
        validator = schema_validator("rotation")
        for spoil in (lambda d: d["units"].update(npv="EUR"),
                      lambda d: d.pop("run"),
                      lambda d: d["run"]["inputs"].update(colour="red"),
                      lambda d: d["final_cut"].update(volume="608")):
            spoilt = json.loads(json.dumps(document))
            spoil(spoilt)
            self.assertFalse(validator.is_valid(spoilt))


class TablesTest(DataFolder, TableChecks, unittest.TestCase):
    """TSV and CSV keep every block rectangular and hold the same cells, and
    the figures JSON gives are the ones the tables print."""

    def test_tsv_and_csv_blocks_are_rectangular_and_agree(self):
        for name, arguments in COMMANDS.items():
            with self.subTest(command=name):
                tsv = read_tsv(self.run_cli(arguments).decode("utf-8"))
                self.assertEqual(self.run_cli([*arguments, "--format", "tsv"]),
                                 "\n".join("\t".join(r) for r in tsv).encode() + b"\n")
                csv_rows = read_csv(self.run_cli([*arguments, "--format", "csv"]).decode())
                self.assertRectangular(tsv, f"{name} tsv")
                self.assertRectangular(csv_rows, f"{name} csv")
                self.assertEqual([r for r in csv_rows if r], [r for r in tsv if r != [""]])

    def test_json_carries_the_figures_of_the_tables(self):
        # (command, the block's title or None for the first table, JSON array)
        for name, title, key in (("project", None, "states"), ("assort", None, "classes"),
                                 ("rotation", "by_age", "by_age"),
                                 ("rotation", "cashflow", "cashflow"),
                                 ("uncertainty", "tornado", "tornado")):
            with self.subTest(command=name, table=key):
                rows = read_tsv(self.run_cli(COMMANDS[name]).decode())
                start = 0 if title is None else rows.index([f"# {title}"]) + 1
                table = next(blocks(rows[start:]))
                document = strict_json(self.run_cli([*COMMANDS[name], "--format", "json"]))
                self.assertCellsAre(table[0], table[1:], document[key], key)


# A rotation in the main window: grow, thin with both assortment reports
# kept, grow on and fell.
ROTATION_SCRIPT = """model 0
set txtFromA 15
set txtFromN 2500
set txtFromH 9
set txtFromB 22
set txtNetArea 10
set txtToA 30
set txtByA 5
press cmdGrow
press cmdThin
set frmThin.txtRemV 50
press frmThin.cmdThin
press frmThin.cmdAssort(0)
press frmAssort.cmdAccept
press frmThin.cmdAssort(1)
press frmAssort.cmdAccept
press frmThin.cmdAccept
set txtToA 60
press cmdGrow
answer yes
press cmdFinalCut
"""


class RunnerTest(DataFolder, TableChecks, unittest.TestCase):
    """The runner's tables after a thinning and a final cut."""

    def printed(self, command):
        script = self.work / "rotation.arb"
        script.write_text(ROTATION_SCRIPT + command + "\n", encoding="utf-8")
        out = self.run_cli(["run", str(script)]).decode("utf-8")
        return [row for row in read_tsv(out) if row[0] not in ("MSG", "ASK")]

    def test_flxmain_is_rectangular_with_each_rows_label(self):
        rows = self.printed("print flxMain")
        self.assertRectangular(rows, "flxMain")
        self.assertEqual(rows[0][:3], ["Row", "Age", "Top Ht"])
        labels = [row[0] for row in rows[1:]]
        for label in ("G yr", "T yr", "AC yr", "AT yr", "FC yr"):
            self.assertIn(label, labels)
        self.assertEqual(len(rows[0]), 27)

    def test_flxsummary_is_rectangular_with_each_rows_label(self):
        rows = self.printed("press cmdSummary\nprint flxSummary")
        self.assertRectangular(rows, "flxSummary")
        labels = [row[0] for row in rows[1:]]
        for label in ("Start", "Thinning", "Final cut"):
            self.assertIn(label, labels)


class RerunTest(DataFolder, unittest.TestCase):
    """A run again from the inputs its record gives reproduces its document."""

    @staticmethod
    def options(run):
        """The command line of a run record: each input an option."""
        arguments = [run["command"]]
        for key, value in run["inputs"].items():
            if value is None:
                continue
            values = value if isinstance(value, list) else [value]
            arguments += ["--" + key.replace("_", "-"), *(str(v) for v in values)]
        return arguments

    def test_rotation_optimise_and_uncertainty_repeat_from_their_record(self):
        # Options a user leaves out, or gives in another form (--dbh for the
        # basal area), come back as the values they stood for.
        given = {
            "rotation": ["rotation", "--model", "0", "--age", "15", "--stocking", "2500",
                         "--height", "7", "--dbh", "10.0925", *REGIME, "--rate", "2.75"],
            "optimise": [*COMMANDS["optimise"][:-2], "--objective", "volume"],
            "uncertainty": ["uncertainty", *STAND, "--rotation", "45", "--draws", "300",
                            "--price-spread", "0.3"],
            "carbon": ["rotation", *STAND, *REGIME, "--carbon-price", "40"],
        }
        for name, arguments in given.items():
            with self.subTest(command=name):
                first = self.run_cli([*arguments, "--format", "json"])
                again = self.run_cli(self.options(strict_json(first)["run"]))
                self.assertEqual(TIME.sub(b"", again), TIME.sub(b"", first))


class EstateTest(DataFolder, TableChecks, unittest.TestCase):
    """The estate's JSON tables against their schemas and the CSV; that every
    format keeps its lines as wide as the header is the writer's
    (tests/estate/tablefile_test.cpp)."""

    ESTATE = ("id,model,age,stocking,top_height,basal_area,area_ha,rotation,note\n"
              "A1,0,15,2500,7,20,2.5,50,\"fenced, \"\"deer\"\"\tsee\nmap\"\n"
              "A2,8,18,2200,9,22,4,,Müller\n"
              "B1,0,9,2500,7,20,1,50,too young\n")

    def estate(self, out, fmt):
        source = self.work / "estate.csv"
        source.write_text(self.ESTATE, encoding="utf-8")
        self.run_cli(["estate", str(source), "--out", str(self.work / out), "--year", "2030",
                      "--rate", "3", "--thin-from", "20", "--thin-every", "5",
                      "--thin-volume", "40", "--threads", "2", "--format", fmt],
                     expected_status=1)
        return self.work / out

    def test_json_tables_validate_and_carry_the_csv_figures(self):
        plain = self.estate("csv", "csv")
        folder = self.estate("json", "json")
        for table in ("subcompartments", "forecast", "errors"):
            with self.subTest(table=table):
                document = strict_json((folder / f"{table}.json").read_bytes())
                schema_validator("estate-" + table).validate(document)
                rows = read_csv((plain / f"{table}.csv").read_text(encoding="utf-8"))
                self.assertEqual(document["columns"], rows[0])
                self.assertCellsAre(rows[0], rows[1:], document["rows"], table)
                self.assertEqual(document["run"]["inputs"]["year"], 2030)
                input_file = document["run"]["files"][-1]
                self.assertTrue(input_file["name"].endswith("estate.csv"))
                self.assertRegex(input_file["sha256"], "^[0-9a-f]{64}$")


if __name__ == "__main__":
    unittest.main()
