#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Whether scripts/check-layers.py finds what it is there for, and nothing else."""
import importlib.util
import pathlib
import sys
import tempfile
import unittest

sys.dont_write_bytecode = True
ROOT = pathlib.Path(__file__).resolve().parents[2]
SCRIPT = ROOT / "scripts/check-layers.py"
spec = importlib.util.spec_from_file_location("check_layers", SCRIPT)
layers = importlib.util.module_from_spec(spec)
spec.loader.exec_module(layers)

TABLE = """# A tree

| Room | What | May know | Others' headers |
|---|---|---|---|
| `ground/` | the ground | nobody | none |
| `ground/well` | the way down | `ground/` | water |
| `rooms/<name>/` | the rooms | `ground/` | none |
| `rooms/<name>/window` | what looks out | `rooms/<name>/`, `ground/well` | water, fire |
| `roof/` | over all | everything | everything |

- `<name>`: `east`, `west`.
- water: `rain/*`.
- fire: `hearth.h`.
"""
SOUND = {
    "docs/architecture.md": TABLE,
    "ground/stone.hpp": "#pragma once\n#include <vector>\n#include <string.h>\n",
    "ground/stone.cpp": '#include "ground/stone.hpp"\n',
    "ground/well.hpp": '#pragma once\n#include "stone.hpp"\n#include <rain/drop.h>\n',
    "rooms/east/bed.hpp": '#pragma once\n#include "ground/stone.hpp"\n',
    "rooms/east/window.cpp": '#include "rooms/east/bed.hpp"\n#include "ground/well.hpp"\n'
                             "#include <hearth.h>\n",
    "rooms/west/bed.hpp": "#pragma once\n// #include <hearth.h>\n/*\n#include <hearth.h>\n*/\n",
    "roof/tile.cpp": '#include "rooms/west/bed.hpp"\n#include <sky.h>\n',
    "build/made.cpp": '#include "anything.hpp"\n',
}


def findings(files):
    with tempfile.TemporaryDirectory() as folder:
        root = pathlib.Path(folder)
        for name, text in files.items():
            (root / name).parent.mkdir(parents=True, exist_ok=True)
            (root / name).write_text(text, encoding="utf-8")
        return layers.check(root)


def with_line(name, line):
    return {**SOUND, name: SOUND[name] + line + "\n"}


def with_table(old, new):
    assert old in TABLE
    return {**SOUND, "docs/architecture.md": TABLE.replace(old, new)}


class PlantedGaps(unittest.TestCase):
    def assert_found(self, files, *expected):
        self.assertEqual(findings(files), list(expected))

    def test_a_sound_tree_passes(self):
        self.assert_found(SOUND)

    def test_an_arrow_that_is_not_in_the_table(self):
        self.assert_found(
            with_line("ground/stone.hpp", '#include "rooms/west/bed.hpp"'),
            "ground/stone.hpp:4: ground/ may not know rooms/west/, "
            "but includes rooms/west/bed.hpp")

    def test_an_arrow_between_rooms_of_one_row(self):
        self.assert_found(
            with_line("rooms/east/bed.hpp", '  #  include "rooms/west/bed.hpp"'),
            "rooms/east/bed.hpp:3: rooms/east/ may not know rooms/west/, "
            "but includes rooms/west/bed.hpp")

    def test_an_arrow_to_a_unit_in_a_folder_that_may_be_known(self):
        self.assert_found(
            with_line("rooms/east/bed.hpp", '#include "ground/well.hpp"'),
            "rooms/east/bed.hpp:3: rooms/east/ may not know ground/well, "
            "but includes ground/well.hpp")

    def test_an_include_from_beside_the_file(self):
        self.assert_found(
            with_line("ground/stone.cpp", '#include "well.hpp"'),
            "ground/stone.cpp:2: ground/ may not know ground/well, but includes ground/well.hpp",
            "ground/stone.cpp:2: a circle: ground/stone -> ground/well -> ground/stone")

    def test_a_circle_of_units_in_one_room(self):
        files = {**SOUND, "rooms/west/lamp.hpp": '#include "bed.hpp"\n',
                 "rooms/west/bed.cpp": '#include "rooms/west/bed.hpp"\n\n'
                                       '#include "rooms/west/lamp.hpp"\n'}
        self.assert_found(
            files, "rooms/west/bed.cpp:3: a circle: "
                   "rooms/west/bed -> rooms/west/lamp -> rooms/west/bed")

    def test_a_circle_of_three(self):
        files = {**SOUND, "ground/a.hpp": '#include "b.hpp"\n', "ground/b.hpp": '#include "c.hpp"\n',
                 "ground/c.hpp": '#include "a.hpp"\n'}
        self.assert_found(
            files, "ground/a.hpp:1: a circle: ground/a -> ground/b -> ground/c -> ground/a")

    def test_a_header_of_others(self):
        self.assert_found(with_line("rooms/east/bed.hpp", "#include <rain/drop.h>"),
                          "rooms/east/bed.hpp:3: rooms/east/ may not include rain/drop.h")

    def test_a_header_that_the_row_does_not_have_though_another_does(self):
        self.assert_found(with_line("ground/well.hpp", "#include <hearth.h>"),
                          "ground/well.hpp:4: ground/well may not include hearth.h")

    def test_a_source_that_is_included(self):
        self.assert_found(
            with_line("roof/tile.cpp", '#include "ground/stone.cpp"'),
            "roof/tile.cpp:3: includes ground/stone.cpp, which is compiled by itself")

    def test_a_file_that_is_not_there(self):
        self.assert_found(with_line("ground/stone.hpp", '#include "ground/sand.hpp"'),
                          "ground/stone.hpp:4: ground/ may not include ground/sand.hpp")

    def test_an_unknown_folder(self):
        self.assert_found({**SOUND, "garden/tree.cpp": ""},
                          "garden/tree.cpp: no row of docs/architecture.md names it")

    def test_an_unknown_name_of_a_placeholder(self):
        self.assert_found({**SOUND, "rooms/north/bed.cpp": ""},
                          "rooms/north/bed.cpp: no row of docs/architecture.md names it")

    def test_a_row_without_files(self):
        self.assert_found(with_table("| `roof/`", "| `cellar/` | - | nobody | none |\n| `roof/`"),
                          "docs/architecture.md:9: there is nothing in cellar/")

    def test_a_row_that_knows_what_does_not_exist(self):
        self.assert_found(with_table("| `ground/` | water |", "| `ground/`, `sea/` | water |"),
                          "docs/architecture.md:6: sea/ is neither a room nor a unit")

    def test_a_circle_of_rows(self):
        self.assert_found(
            with_table("the ground | nobody", "the ground | `ground/well`"),
            "docs/architecture.md:5: a circle of rooms: ground/ -> ground/well -> ground/")

    def test_a_word_that_nothing_explains(self):
        self.assert_found(with_table("| water, fire |", "| water, wind |"),
                          "docs/architecture.md:8: nothing says what wind is")

    def test_a_table_that_is_not_there(self):
        self.assert_found({"docs/architecture.md": "# A tree\n"},
                          "docs/architecture.md: there is no table "
                          "| Room | What | May know | Others' headers |")


FORBIDDEN = [
    ("include/ims.h", "src/log.hpp"), ("include/ims.h", "<glib.h>"),
    ("platform/platform.h", "include/ims.h"), ("platform/platform.h", "<glib.h>"),
    ("tpdu/pdu.hpp", "sim/base/result.hpp"), ("tpdu/pdu.hpp", "<fmt/format.h>"),
    ("tpdu/pdu.hpp", "<glib.h>"),
    ("src/wire/wire.cpp", "src/log.hpp"), ("src/wire/wire.cpp", "src/client.hpp"),
    ("src/wire/wire.cpp", "include/ims_types.h"), ("src/wire/wire.cpp", "<fmt/format.h>"),
    ("src/frame.cpp", "include/ims_call.h"), ("src/frame.cpp", "src/poc_records.hpp"),
    ("src/frame.cpp", "<nlohmann/json.hpp>"), ("src/frame.cpp", "sim/base/result.hpp"),
    ("src/ims_call.cpp", "src/poc_records.hpp"), ("src/ims_call.cpp", "src/ims_poc.hpp"),
    ("src/ims_settings.cpp", "src/xdm_records.hpp"), ("src/ims_call.cpp", "tpdu/pdu.hpp"),
    ("sim/base/clock.hpp", "sim/bus/bus.hpp"), ("sim/base/clock.hpp", "sim/call/model.hpp"),
    ("sim/base/clock.hpp", "<gio/gio.h>"), ("sim/base/clock.hpp", "src/wire/glib.hpp"),
    ("sim/bus/service.cpp", "sim/call/model.hpp"), ("sim/bus/service.cpp", "include/ims.h"),
    ("sim/bus/service.cpp", "src/wire/wire.hpp"),
    *((f"sim/{module}/model.cpp", target)
      for module in ("registration", "call", "sms", "ss", "settings", "ptt", "group", "vt")
      for target in ("sim/bus/wire.hpp", f"sim/{module}/interface.hpp", "sim/base/glib_ref.hpp",
                     "sim/base/main_loop.hpp", "<gio/gio.h>", "<glib.h>", "include/ims.h",
                     "src/frame.hpp", "sim/network.hpp", "sim/stand_in.hpp",
                     "imsctl/output/fields.hpp")),
    ("sim/ss/model.hpp", "sim/call/values.hpp"), ("sim/call/model.hpp", "sim/vt/model.hpp"),
    ("sim/call/model.hpp", "sim/sms/parties.hpp"), ("sim/sms/model.hpp", "sim/call/parties.hpp"),
    ("sim/ptt/model.hpp", "sim/call/parties.hpp"), ("sim/ptt/model.hpp", "sim/group/model.hpp"),
    ("sim/group/model.hpp", "sim/ptt/model.hpp"), ("sim/call/model.cpp", "<nlohmann/json.hpp>"),
    ("sim/call/interface.cpp", "sim/vt/interface.hpp"), ("sim/vt/interface.cpp", "sim/ptt/wire.hpp"),
    ("sim/call/interface.cpp", "sim/network.hpp"), ("sim/call/interface.cpp", "<CLI/CLI.hpp>"),
    ("sim/network.cpp", "sim/bus/bus.hpp"), ("sim/network.cpp", "sim/call/interface.hpp"),
    ("sim/network.cpp", "sim/ptt/wire.hpp"), ("sim/network.cpp", "sim/base/main_loop.hpp"),
    ("sim/network.cpp", "sim/stand_in.hpp"), ("sim/network.cpp", "<gio/gio.h>"),
    ("sim/stand_in.cpp", "sim/call/model.hpp"), ("sim/stand_in.cpp", "sim/program.hpp"),
    ("sim/options.cpp", "sim/stand_in.hpp"), ("sim/main.cpp", "sim/stand_in.hpp"),
    ("sim/program.hpp", "sim/stand_in.hpp"),
    ("imsctl/output/output.hpp", "imsctl/client/client.hpp"),
    ("imsctl/output/output.hpp", "imsctl/line/verbs.hpp"),
    ("imsctl/output/output.hpp", "imsctl/sms/send.hpp"), ("imsctl/output/output.hpp", "<CLI/CLI.hpp>"),
    ("imsctl/client/client.hpp", "imsctl/line/verbs.hpp"),
    ("imsctl/client/client.hpp", "imsctl/call/dial.hpp"), ("imsctl/client/client.hpp", "<gio/gio.h>"),
    ("imsctl/line/verbs.cpp", "imsctl/call/dial.hpp"), ("imsctl/line/verbs.cpp", "tpdu/pdu.hpp"),
    ("imsctl/call/verbs.cpp", "imsctl/sms/send.hpp"), ("imsctl/sms/verbs.cpp", "imsctl/ptt/talk.hpp"),
    ("imsctl/call/verbs.cpp", "imsctl/main.hpp"), ("imsctl/call/verbs.cpp", "src/frame.hpp"),
    ("imsctl/call/verbs.cpp", "sim/base/result.hpp"), ("imsctl/call/verbs.cpp", "<CLI/CLI.hpp>"),
    ("imsctl/main.cpp", "imsctl/output/output.hpp"),
    ("examples/place_call.c", "src/frame.hpp"), ("examples/place_call.c", "platform/platform.h"),
    ("examples/place_call.c", "<gio/gio.h>"),
    ("bench/client.cpp", "src/frame.hpp"), ("bench/client.cpp", "src/poc_records.hpp"),
    ("bench/client.cpp", "sim/base/result.hpp"), ("bench/client.cpp", "tests/support/pump.hpp"),
]
ALLOWED = [
    ("src/log.hpp", "platform/platform.h"), ("src/frame.hpp", "src/wire/wire.hpp"),
    ("src/frame.hpp", "include/ims_types.h"), ("src/ims_poc.cpp", "src/poc_records.hpp"),
    ("src/ims_xdm.cpp", "src/xdm_replies.hpp"), ("src/ims_call.cpp", "include/ims_call.h"),
    ("src/wire/wire.hpp", "<gio/gio.h>"),
    ("sim/bus/bus.hpp", "sim/base/glib_ref.hpp"), ("sim/base/child.cpp", "sim/base/main_loop.hpp"),
    ("sim/call/model.hpp", "sim/ss/model.hpp"), ("sim/vt/model.hpp", "sim/call/events.hpp"),
    ("sim/ptt/participants.hpp", "sim/group/answers.hpp"),
    ("sim/sms/model.hpp", "tpdu/tpdu.hpp"), ("sim/call/model.hpp", "sim/registration/model.hpp"),
    ("sim/call/interface.cpp", "sim/bus/ask.hpp"), ("sim/call/signals.cpp", "sim/call/events.hpp"),
    ("sim/ptt/interface.cpp", "sim/ptt/wire.hpp"), ("sim/ptt/wire.hpp", "<gio/gio.h>"),
    ("sim/registration/login_interface.cpp", "sim/bus/tell.hpp"),
    ("sim/network.hpp", "sim/ptt/model.hpp"), ("sim/stand_in.hpp", "sim/network.hpp"),
    ("sim/stand_in.cpp", "sim/call/signals.hpp"), ("sim/run.cpp", "sim/stand_in.hpp"),
    ("imsctl/client/client.hpp", "imsctl/output/output.hpp"),
    ("imsctl/line/verbs.hpp", "imsctl/client/client.hpp"), ("imsctl/line/verbs.cpp", "<CLI/CLI.hpp>"),
    ("imsctl/sms/send.cpp", "tpdu/tpdu.hpp"), ("imsctl/sms/send.cpp", "include/ims.h"),
    ("imsctl/main.cpp", "imsctl/call/verbs.hpp"),
    ("examples/place_call.c", "include/ims.h"), ("bench/client.cpp", "src/settings_fields.hpp"),
    ("tests/sim/network.cpp", "sim/network.hpp"), ("tests/sim/network.cpp", "<anything.h>"),
]


class TheHouse(unittest.TestCase):
    """The table of this tree, with files that need not be there."""

    def found_for(self, path, included):
        files = {"docs/architecture.md":
                 (ROOT / "docs/architecture.md").read_text(encoding="utf-8"),
                 path: f"\n#include {included}\n"}
        if not included.startswith("<"):
            files[included] = ""
            files[path] = f'\n#include "{included}"\n'
        return [line for line in findings(files) if line.startswith(f"{path}:2: ")]

    def test_what_is_forbidden(self):
        for path, included in FORBIDDEN:
            with self.subTest(f"{path} includes {included}"):
                self.assertEqual(len(self.found_for(path, included)), 1)

    def test_what_is_allowed(self):
        for path, included in ALLOWED:
            with self.subTest(f"{path} includes {included}"):
                self.assertEqual(self.found_for(path, included), [])


if __name__ == "__main__":
    unittest.main()
