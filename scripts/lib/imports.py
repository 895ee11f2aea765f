#!/usr/bin/env python3
"""What a program for Windows asks of the system before its first line runs: fails on anything that Windows XP lacks.

    imports.py PROGRAM TABLE [--compiler COMPILER]

TABLE lists the functions that may be imported, under the names of their libraries, each looked up in its published
documentation. One that isn't listed fails until somebody has looked it up. A compiler's headers say the same once more:
what they don't declare for XP is newer, and a function of the C library is to be in the one of XP's age."""
import argparse
import re
import struct
import subprocess
import sys

LIBRARIES = {"kernel32.dll", "user32.dll", "gdi32.dll", "msvcrt.dll"}
VERSION = (5, 1)
I386, PE32 = 0x14C, 0x10B
IMPORTS, DELAYED_IMPORTS = 1, 13


class Program:
    """A program's headers. What isn't one raises ValueError or struct.error."""

    def __init__(self, data):
        self.data = data
        if data[:2] != b"MZ":
            raise ValueError("is no program")
        header = self.number("<I", 0x3C)
        if data[header:header + 4] != b"PE\0\0":
            raise ValueError("is no program for Windows")
        self.machine, sections = struct.unpack_from("<HH", data, header + 4)
        optional = header + 24
        table = optional + self.number("<H", header + 20)
        self.kind = self.number("<H", optional)
        if (self.machine, self.kind) != (I386, PE32):
            raise ValueError("is not of 32 bits")
        self.system_version = struct.unpack_from("<HH", data, optional + 40)
        self.windows_version = struct.unpack_from("<HH", data, optional + 48)
        self.directories = [struct.unpack_from("<II", data, optional + 96 + 8 * i)
                            for i in range(self.number("<I", optional + 92))]
        self.sections = [struct.unpack_from("<IIII", data, table + 40 * i + 8) for i in range(sections)]

    def number(self, form, at):
        return struct.unpack_from(form, self.data, at)[0]

    def place(self, address):
        """Where in the file lies what the system loads to that address."""
        for size, start, raw_size, raw in self.sections:
            if start <= address < start + max(size, raw_size):
                return raw + address - start
        raise ValueError(f"has nothing at {address:#x}")

    def text(self, address):
        at = self.place(address)
        return self.data[at:self.data.index(b"\0", at)].decode("latin-1")

    def directory(self, index):
        return self.directories[index][0] if index < len(self.directories) else 0

    def imports(self):
        """Pairs of a library and a function; of a number, where it is imported without a name."""
        listed = self.directory(IMPORTS)
        at = self.place(listed) if listed else None
        while at is not None:
            names, _, _, library, addresses = struct.unpack_from("<IIIII", self.data, at)
            if library == 0:
                return
            yield from ((self.text(library).lower(), function) for function in self.functions(names or addresses))
            at += 20

    def functions(self, address):
        at = self.place(address)
        while entry := self.number("<I", at):
            yield f"number {entry & 0xFFFF}" if entry >> 31 else self.text(entry + 2)
            at += 4


def read_table(path):
    """Pairs of a library and a function."""
    table, library = set(), None
    with open(path, encoding="utf-8") as lines:
        for line in lines:
            word = line.split("#")[0].strip()
            if word.startswith("["):
                library = word.strip("[]")
            elif word:
                table.add((library, word))
    return table


def declared_for_xp(compiler):
    """The words of the system's headers as they are for XP."""
    told = subprocess.run([compiler, "-E", "-x", "c++", "-D_WIN32_WINNT=0x0501", "-DWINVER=0x0501", "-"],
                          input="#include <windows.h>\n#include <tlhelp32.h>\n", capture_output=True, text=True, check=True).stdout
    return set(re.findall(r"\w+", told))


def in_c_library_of_xp(compiler):
    """The C library that was published beside XP's, by the compiler's list of it."""
    ask = [compiler, "-print-file-name=libmsvcr70.a"]
    library = subprocess.run(ask, capture_output=True, text=True, check=True).stdout.strip()
    ask = [compiler.replace("-g++-win32", "-nm").replace("-g++", "-nm"), library]
    told = subprocess.run(ask, capture_output=True, text=True, check=True).stdout
    return {name.split("@")[0] for name in re.findall(r"__imp__(\S+)", told)}


def faults(program, table, compiler):
    for what, version in (("system", program.system_version), ("windows", program.windows_version)):
        if version != VERSION:
            yield f"asks for a {what} of version {version[0]}.{version[1]}"
    if program.directory(DELAYED_IMPORTS):
        yield "has delayed imports, which are searched for beside the program"
    declared = declared_for_xp(compiler) if compiler else None
    of_c = in_c_library_of_xp(compiler) if compiler else None
    for library, function in program.imports():
        if library not in LIBRARIES:
            yield f"imports {library} ({function})"
        elif (library, function) not in table:
            yield f"imports {function} of {library}, which nobody has looked up"
        elif compiler and function not in (of_c if library == "msvcrt.dll" else declared):
            yield f"imports {function} of {library}, which the compiler's headers don't have for XP"


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("program")
    parser.add_argument("table")
    parser.add_argument("--compiler")
    asked = parser.parse_args()
    try:
        with open(asked.program, "rb") as file:
            program = Program(file.read())
        found = sorted(set(faults(program, read_table(asked.table), asked.compiler)))
        count = len(set(program.imports()))
    except (ValueError, struct.error) as error:
        found, count = [str(error)], 0
    for fault in found:
        print(f"{asked.program} {fault}")
    print(f"{count} imports, {len(found)} faults")
    return 1 if found else 0


if __name__ == "__main__":
    sys.exit(main())
