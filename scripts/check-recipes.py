#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Follows two recipes of docs/contributing.md, for a request and for a verb, in a copy of the tree.

Usage: check-recipes.py [--tests]

Adds a made-up request to video telephony and a verb that makes it, in the files that the recipes
list and in no others, builds the programs, and shows that the request gets to the stand-in and its
answer back, and that help knows the verb. With --tests, what the recipes add to the tests is built
and run as well. Everything is below build/recipes, so that a second time only what has changed is
built. The first time takes two to five minutes of processor time, the tests as much again; nothing
else runs this.
"""
import pathlib
import re
import shutil
import subprocess
import sys

ROOT = pathlib.Path(__file__).resolve().parent.parent
PAGE = ROOT / "docs/contributing.md"
COPY = ROOT / "build/recipes/tree"
BUILD = ROOT / "build/recipes/build"

MODULE = {"<api>": "vt", "<module>": "vt", "<Module>": "Vt"}

# The steps of each recipe: a file, a text that stands there once, what is put in front of it.
RECIPES = {
    "A request": [
        ("include/ims_vt.h", "/**\n * Sets the buffer of the media.\n",
         "/**\n * Takes a sample.\n *\n * D-Bus: `TakeSample`, sends `(i)`.\n *\n"
         " * @param value  how large\n */\n"
         "IMS_API int ims_vt_take_sample(ims_h handle, int32_t value, ims_response_cb callback,\n"
         "                               void *user_data);\n\n"),
        ("src/libkelvo-ims.map", "    ims_xdm_add_group_rule;\n", "    ims_vt_take_sample;\n"),
        ("src/ims_vt.cpp", "int ims_vt_set_media_buffer(",
         "int ims_vt_take_sample(ims_h handle, int32_t value, ims_response_cb callback,\n"
         "                       void *user_data) {\n"
         "    if (const int refused = admit({handle}))\n"
         "        return refused;\n"
         "    return request(handle, kInterface, \"TakeSample\", pack<\"(i)\">(value),\n"
         "                   {answer<\"on_response_common_response\">, callback, user_data});\n"
         "}\n\n"),
        ("dbus/interfaces/org.kelvo.ims.Vt.xml", "    <!-- Stops the camera. -->\n",
         "    <!-- Takes a sample. -->\n"
         "    <method name=\"TakeSample\">\n"
         "      <arg name=\"value_1\" type=\"i\" direction=\"in\"/>\n"
         "      <arg name=\"result\" type=\"i\" direction=\"out\"/>\n"
         "    </method>\n\n"),
        ("docs/wire-contract.md", None, None),  # is made of the files
        ("sim/vt/model.hpp", "    Status stop_camera(int slot, int id);\n",
         "    Status take_sample(int slot, std::int32_t value);\n"),
        ("sim/vt/camera.cpp", "Status VideoTelephony::stop_camera(",
         "Status VideoTelephony::take_sample(int, std::int32_t value) {\n"
         "    if (value < 0)\n"
         "        return refuse(Result::kInvalidArgument, \"a sample is not {}\", value);\n"
         "    return Done{};\n"
         "}\n\n"),
        ("sim/vt/interface.cpp", "    {\"StopCamera\", ",
         "    {\"TakeSample\", ask<&Vt::take_sample>, kConnection},\n"),
        ("docs/stand-in/vt.md", "| StopCamera |",
         "| TakeSample | value | nothing | 10 a negative value |\n"),
        ("tests/library/vt/vt_rows.cpp",
         "        {.function = request<ims_vt_stop_camera, kSession>(),\n",
         "        {.function = request<ims_vt_take_sample, kSession>(),\n"
         "         .method = \"TakeSample\",\n"
         "         .type = \"(i)\",\n"
         "         .arguments = \"(7,)\"},\n"),
        ("tests/sim/vt/model_test.cpp", "TEST_F(VideoCall, OnlyVideoCallsHaveVideo) {\n",
         "TEST_F(VideoCall, TakesSamplesOfNothingNegative) {\n"
         "    expect_accepted(video_.take_sample(0, 0));\n"
         "    bad_argument(video_.take_sample(0, -1), \"a sample is not -1\");\n"
         "}\n\n"),
        ("tests/sim/bus/methods_test.cpp", "    {kVt, \"StopCamera\", ",
         "    {kVt, \"TakeSample\", \"(i)\", \"(i)\", kNotNamed},\n"),
    ],
    "A verb": [
        ("imsctl/vt/verbs.cpp", "constexpr Verb kVtVerbs[] = {\n",
         "Action prepare_sample(Arguments &arguments) {\n"
         "    return with_number(arguments.number(\"VALUE\", \"how large\"), ims_vt_take_sample);\n"
         "}\n\n"),
        ("imsctl/vt/verbs.cpp", "    {\"vt camera stop\", ",
         "    {\"vt sample take\", \"take a sample\", \"vt sample take 7\", prepare_sample},\n"),
        ("imsctl/vt/module.cpp", "    {\"vt camera\", ",
         "    {\"vt sample\", \"samples of anything\"},\n"),
        ("docs/imsctl.md", "| `vt camera stop [SESSION]`", "| `vt sample take VALUE` | |\n"),
        ("tests/imsctl/vt/requests_test.cpp", "    {\"vt camera stop 7\", ",
         "    {\"vt sample take 7\", 3, \"Vt.TakeSample\", \"(i)\", \"(7,)\", \"(i)\", \"(0,)\","
         " \"(77,)\", R\"({})\", \"ok\"},\n"),
    ],
}

PROGRAMS = ["ims-sim", "imsctl"]
TESTS = ["contract_test", "vt_test", "sim_model_tests", "sim_bus_tests", "imsctl_unit_tests",
         "imsctl_process_tests", "header_c_program"]
# Those that know of the request or the verb. Each has to be there.
TEST_NAMES = [
    "LibraryOnTheBus", "StandInContract", r"contract\.page", r"header\.symbols",
    "take_sample", "TakesSamples", "/TakeSample", "VtTakeSample", "Documentation",
]


def listed(recipe):
    """The files and folders that a recipe names, for the made-up module."""
    page = PAGE.read_text(encoding="utf-8")
    section = re.search(rf"^### {re.escape(recipe)}\n+(.*?)(?=^#)", page, re.DOTALL | re.MULTILINE)
    if not section:
        sys.exit(f"{PAGE.name} has no recipe {recipe!r}")
    for place in re.findall(r"^- (.*?):(?: |$)", section[1], re.DOTALL | re.MULTILINE):
        for name in re.findall(r"`([^`]+)`", place):
            for placeholder, value in MODULE.items():
                name = name.replace(placeholder, value)
            yield name


def strays():
    """Files of a recipe that the page does not list, and the other way round."""
    for recipe, steps in RECIPES.items():
        names = list(listed(recipe))
        files = {name for name, *_ in steps}
        for file in sorted(files):
            if not any(file == name or name.endswith("/") and file.startswith(name)
                       for name in names):
                yield f"{recipe}: {PAGE.name} does not list {file}"
        for name in names:
            if not any(file == name or name.endswith("/") and file.startswith(name)
                       for file in files):
                yield f"{recipe}: {PAGE.name} lists {name}, which nothing is added to"


def planted():
    """The files that the recipes change, with their new texts."""
    texts = {}
    for file, anchor, addition in (step for steps in RECIPES.values() for step in steps):
        if anchor is None:
            continue
        text = texts.get(file) or (ROOT / file).read_text(encoding="utf-8")
        if text.count(anchor) != 1:
            sys.exit(f"{file}: {anchor!r} stands there {text.count(anchor)} times")
        texts[file] = text.replace(anchor, addition + anchor)
    return texts


def update(path, content):
    """Leaves a file that has this content alone, so that nothing is built again for it."""
    if path.is_file() and path.read_bytes() == content:
        return
    path.parent.mkdir(parents=True, exist_ok=True)
    path.write_bytes(content)


def copy_tree():
    names = subprocess.run(["git", "ls-files", "-z", "--cached", "--others", "--exclude-standard"],
                           cwd=ROOT, check=True, capture_output=True, text=True).stdout
    names = [name for name in names.split("\0") if name and (ROOT / name).is_file()]
    changed = planted()
    for name in names:
        content = changed[name].encode() if name in changed else (ROOT / name).read_bytes()
        if name != "docs/wire-contract.md":
            update(COPY / name, content)
            (COPY / name).chmod((ROOT / name).stat().st_mode)
    for path in list(COPY.rglob("*")):
        if path.is_file() and str(path.relative_to(COPY)) not in names:
            path.unlink()
    run([sys.executable, COPY / "scripts/wire-contract.py"])


def run(command, **options):
    """Runs a command that has to succeed; returns what it wrote."""
    done = subprocess.run(command, capture_output=True, text=True, check=False, **options)
    if done.returncode != 0:
        print(done.stdout + done.stderr, file=sys.stderr)
        sys.exit(f"{' '.join(map(str, command))}: status {done.returncode}")
    return done.stdout + done.stderr


def expect(text, *patterns):
    for pattern in patterns:
        if not re.search(pattern, text):
            sys.exit(f"{pattern!r} is not in\n{text}")


def main():
    tests = sys.argv[1:] == ["--tests"]
    if sys.argv[1:] and not tests:
        sys.exit(__doc__)
    for stray in (found := list(strays())):
        print(stray, file=sys.stderr)
    if found:
        sys.exit(1)
    copy_tree()

    run(["cmake", "-S", COPY, "-B", BUILD, "-G", "Ninja", "-DIMS_WERROR=ON",
         "-DIMS_JOIN_FOLDERS=ON", "-DIMS_CCACHE=ON",
         f"-DBUILD_TESTING={'ON' if tests else 'OFF'}"])
    run(["cmake", "--build", BUILD, "--target", *PROGRAMS, *(TESTS if tests else [])])

    sim, ctl = BUILD / "bin/ims-sim", BUILD / "bin/imsctl"
    crossed = run([sim, "run", "--verbose", "--", ctl, "vt", "sample", "take", "7"])
    expect(crossed, r"sub0 TakeSample \(7,\) from \S+ \(.*\) -> \(0,\)")
    print("the request crosses the bus, and its answer comes back")
    refused = subprocess.run([sim, "run", "--", ctl, "vt", "sample", "take", "--", "-7"],
                             capture_output=True, text=True, check=False)
    expect(refused.stderr, "refused with 10: a sample is not -7", "result 10")
    print("a refusal comes back")
    expect(run([ctl, "vt", "--help"]), r"sample +samples of anything")
    expect(run([ctl, "vt", "sample", "--help"]), r"take +take a sample")
    expect(run([ctl, "vt", "sample", "take", "--help"]), "vt sample take 7")
    expect(run([ctl, "__complete", "vt", "sa"]), "sample")
    print("help and completion know the verb")
    if tests:
        told = run(["ctest", "--test-dir", BUILD, "--no-tests=error", "--output-on-failure",
                    "--timeout", "60", "--tests-regex", "|".join(TEST_NAMES)])
        expect(told, *TEST_NAMES)
        print(re.search(r"\d+% tests passed.*", told)[0])


if __name__ == "__main__":
    main()
