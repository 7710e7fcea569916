#!/usr/bin/env python3
"""Prints the size of the tests against the size of the code they test.

Counted are non-blank, non-comment lines of C++ (// and /* */ comments), CMake,
Python and shell ('#' comments); golden outputs, corpora and other data are not.
Tests are tests/; code is the library folders, include/, tools/ and training/.

usage: tools/test-ratio.py [--by-folder] [SOURCE_DIR]
"""
import os
import sys

CODE_FOLDERS = ["pitch", "scale", "chord", "naming", "nnet", "midi", "include", "tools", "training"]
C_LIKE = (".c", ".cc", ".cpp", ".h", ".hpp")
HASH_COMMENTS = (".cmake", ".py", ".sh")


def counted_lines(path):
    c_like = path.endswith(C_LIKE)
    count, in_block = 0, False
    with open(path, errors="replace") as source:
        for line in source:
            text = line.strip()
            if not c_like:
                count += bool(text) and not text.startswith("#")
                continue
            if in_block:
                if "*/" not in text:
                    continue
                in_block, text = False, text.split("*/", 1)[1].strip()
            if text.startswith("/*") and "*/" not in text:
                in_block = True
            elif text and not text.startswith("//") and not (text.startswith("/*") and text.endswith("*/")):
                count += 1
    return count


def folder_lines(root, folder):
    total = 0
    for base, _, files in os.walk(os.path.join(root, folder)):
        for name in files:
            if name.endswith(C_LIKE + HASH_COMMENTS) or name == "CMakeLists.txt":
                total += counted_lines(os.path.join(base, name))
    return total


def main(args):
    by_folder = "--by-folder" in args
    roots = [a for a in args if a != "--by-folder"]
    root = roots[0] if roots else os.path.join(os.path.dirname(os.path.abspath(__file__)), "..")
    code = {folder: folder_lines(root, folder) for folder in CODE_FOLDERS}
    test_root = os.path.join(root, "tests")
    test_folders = sorted(f for f in os.listdir(test_root) if os.path.isdir(os.path.join(test_root, f)))
    tests = {folder: folder_lines(root, os.path.join("tests", folder)) for folder in test_folders}
    test_total = folder_lines(root, "tests")
    code_total = sum(code.values())
    if by_folder:
        for folder, lines in code.items():
            print("code  %-10s %5d" % (folder, lines))
        for folder, lines in tests.items():
            print("tests %-10s %5d" % (folder, lines))
    print("ratio=%.2f tests=%d code=%d" % (test_total / max(1, code_total), test_total, code_total))


main(sys.argv[1:])
