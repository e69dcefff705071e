"""Where the binaries look for libraries: beside themselves, never in the folder in which the user happens to be.

    library_paths.py BUILD_FOLDER CMAKE READELF

Reads every program and library of the build folder, and of an installation made from it in a temporary folder.
"""

import pathlib
import re
import subprocess
import sys
import tempfile


def is_binary(path):
    """A program or a shared library: ELF of the types EXEC and DYN."""
    if path.is_symlink() or not path.is_file():
        return False
    with path.open("rb") as file:
        head = file.read(18)
    return head[:4] == b"\x7fELF" and head[16] in (2, 3)


def faults(path, own_libraries, readelf):
    """What is wrong with the library path of a binary, a sentence each."""
    said = subprocess.run([readelf, "-d", path], capture_output=True, text=True, check=True).stdout
    entries = [entry for paths in re.findall(r"\((?:RPATH|RUNPATH)\).*\[(.*)\]", said) for entry in paths.split(":")]
    for entry in entries:
        if entry != "$ORIGIN" and not entry.startswith("$ORIGIN/"):
            yield f"looks for libraries in {entry!r}"
    folders = [path.parent / entry.replace("$ORIGIN", ".") for entry in entries if entry]
    for needed in re.findall(r"\(NEEDED\).*\[(.*)\]", said):
        if "/" in needed:
            yield f"needs a library by its path, {needed!r}"
        elif needed in own_libraries and not any((folder / needed).exists() for folder in folders):
            yield f"does not find {needed} in {entries}"


def check(root, readelf, at_least):
    binaries = sorted(path for path in root.rglob("*") if is_binary(path))
    names = {path.name for path in binaries}
    missing = at_least - names
    wrong = [f"{root} holds no {name}" for name in sorted(missing)]
    for path in binaries:
        wrong += [f"{path} {fault}" for fault in faults(path, names, readelf)]
    print(f"{root}: {len(binaries)} binaries, {len(wrong)} faults")
    return wrong


def main(build, cmake, readelf):
    product = {"hdkv", "kvrshell", "libks.so", "KAVO0_HD.so", "KAVO0_NW.so", "KAVO0_XS.so"}
    wrong = check(pathlib.Path(build), readelf, product)
    with tempfile.TemporaryDirectory() as folder:
        subprocess.run([cmake, "--install", build, "--prefix", folder], check=True, stdout=subprocess.DEVNULL)
        wrong += check(pathlib.Path(folder), readelf, product)
    print("\n".join(wrong))
    return 1 if wrong else 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
