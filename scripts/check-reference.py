#!/usr/bin/env python3
# SPDX-License-Identifier: Apache-2.0
"""Makes the reference documentation of the public headers, and fails where it has gaps.

Usage: check-reference.py              below build/reference, with Doxygen
       check-reference.py --self-test  only says, with status 1, when a gap would not be found

Doxygen finds undocumented names, parameters that do not exist, and broken references that are
marked as such. Found here is what it lets pass.
"""
import pathlib
import re
import shutil
import subprocess
import sys
import tempfile
import xml.etree.ElementTree as ElementTree

ROOT = pathlib.Path(__file__).resolve().parent.parent
DOXYFILE = pathlib.Path("docs/Doxyfile")
OUTPUT = pathlib.Path("build/reference")

# What all requests share; said once, in the group of the functions that take it.
SHARED = {"handle", "callback", "user_data"}
# A name of the interface that stands in a text without having become a link.
LOOSE_NAME = re.compile(r"\b(?:ims_[a-z0-9_]+(?:\(\)|_s\b|_e\b|_cb\b)|IMS_[A-Z0-9_]+\b)")


def is_documented(member):
    return any("".join(member.find(part).itertext()).strip()
               for part in ("briefdescription", "detaileddescription"))


def place(member):
    location = member.find("location")
    return f"{location.get('file')}:{location.get('line')}"


def undocumented_parameters(member):
    described = {name.text for name in member.iterfind(".//parameterlist//parametername")}
    declared = {name.text for name in member.iterfind("param/declname")}
    return declared - described - SHARED


def loose_names(description):
    """Names in a description, but for those in links, in code and in file names."""
    if description.tag in ("ref", "programlisting", "computeroutput"):
        return
    texts = [description.text, *(child.tail for child in description)]
    for text in filter(None, texts):
        yield from LOOSE_NAME.findall(text)
    for child in description:
        yield from loose_names(child)


def gaps(folder):
    """What Doxygen let pass, one line each."""
    for path in sorted(folder.glob("*.xml")):
        compound = ElementTree.parse(path).getroot().find("compounddef")
        if compound is None or compound.get("kind") == "file":
            continue
        for description in compound.iterfind("detaileddescription"):
            for name in loose_names(description):
                yield f"{compound.findtext('title') or compound.findtext('compoundname')}: " \
                      f"{name} is no link"
        for member in compound.iterfind("sectiondef/memberdef"):
            for part in ("briefdescription", "detaileddescription", "inbodydescription"):
                for name in loose_names(member.find(part)):
                    yield f"{place(member)}: {name} is no link"
            if member.get("kind") == "function":
                for name in sorted(undocumented_parameters(member)):
                    yield f"{place(member)}: {name} of {member.findtext('name')}() " \
                          "is not documented"
            for value in member.iterfind("enumvalue"):
                if not is_documented(value):
                    yield f"{place(member)}: {value.findtext('name')} is not documented"


def check(root):
    """Makes the documentation of a tree. Everything that is wrong with it, one line each."""
    output = root / OUTPUT
    shutil.rmtree(output, ignore_errors=True)
    output.mkdir(parents=True)
    made = subprocess.run(["doxygen", DOXYFILE], cwd=root, capture_output=True, text=True,
                          check=False)
    found = (made.stdout + made.stderr).splitlines()
    if made.returncode != 0 and not found:
        found = [f"doxygen ends with status {made.returncode}"]
    return found + list(gaps(output / "xml"))


# One gap of each kind: the file, what stands there, what is planted in its place, what is to be
# said of it.
PLANTED = [
    ("include/ims_reg.h", "IMS_API int ims_get_registration_info(",
     "IMS_API int ims_planted_get(ims_h handle);\n\n/** Sound. @param info the record */\n"
     "IMS_API int ims_get_registration_info(", "info' of command @param is not found"),
    ("include/ims_reg.h", "/** @} */", "IMS_API int ims_planted_set(ims_h handle);\n/** @} */",
     "ims_planted_set(ims_h handle) (function)"),
    ("include/ims_login.h", "} ims_login_state_s;",
     "    int32_t planted_field;\n} ims_login_state_s;", "planted_field (variable)"),
    ("include/ims_login.h", "/** @} */", "#define IMS_PLANTED_MACRO 1\n/** @} */",
     "IMS_PLANTED_MACRO (macro definition)"),
    ("include/ims_login.h", "IMS_API int ims_logout(ims_h handle,",
     "IMS_API int ims_logout(ims_h handle, int32_t planted_parameter,",
     "planted_parameter of ims_logout() is not documented"),
    ("include/ims_types.h", "IMS_RESPONSE_ACCESS_DENIED = 2",
     "IMS_RESPONSE_ACCESS_DENIED = 2,\n    IMS_PLANTED_VALUE = 3",
     "IMS_PLANTED_VALUE is not documented"),
    ("include/ims_sms.h", "@ref ims_values", "@ref ims_planted_section", "'ims_planted_section'"),
    ("include/ims_sms.h", "#IMS_NOTI_SMS_INCOMING_SMS.", "#IMS_NOTI_PLANTED.",
     "'IMS_NOTI_PLANTED'"),
    ("include/ims_ss.h", "#ims_ss_status_list_s, NULL", "ims_ss_planted_s, NULL",
     "ims_ss_planted_s is no link"),
    ("include/ims_call.h", "ims_call_answer_call() or", "ims_call_planted() or",
     "ims_call_planted() is no link"),
]


def self_test():
    with tempfile.TemporaryDirectory() as folder:
        root = pathlib.Path(folder)
        for part in ("include", "platform"):
            shutil.copytree(ROOT / part, root / part)
        (root / DOXYFILE).parent.mkdir(parents=True)
        shutil.copy(ROOT / DOXYFILE, root / DOXYFILE)
        for name, text, gap, _ in PLANTED:
            path = root / name
            sound = path.read_text(encoding="utf-8")
            if text not in sound:
                sys.exit(f"{name}: there is no {text!r} to plant a gap at")
            path.write_text(sound.replace(text, gap, 1), encoding="utf-8")
        found = check(root)
    missed = [said for *_, said in PLANTED if not any(said in line for line in found)]
    for said in missed:
        print(f"not found: {said}")
    print(f"{len(PLANTED) - len(missed)} of {len(PLANTED)} planted gaps found")
    return 1 if missed else 0


def main():
    if sys.argv[1:] == ["--self-test"]:
        sys.exit(self_test())
    if sys.argv[1:]:
        sys.exit(__doc__)
    found = check(ROOT)
    for line in found:
        print(line, file=sys.stderr)
    if not found:
        print(f"{OUTPUT}/html/index.html")
    sys.exit(1 if found else 0)


if __name__ == "__main__":
    main()
