#!/usr/bin/env python3
"""How much the tests weigh: lines.py ROOT [FOLDER]... Lines of .cpp and .h count, without blanks and comments.

The last line has the sums: tests are tests/ and fuzz/, code is what the libraries and zornet are made of. Each FOLDER
is counted on a line of its own before it.
"""
import pathlib
import re
import sys

CODE = ('host', 'module', 'vector', 'single', 'enum', 'network', 'language', 'zornet')
TOKEN = re.compile(r'"(?:\\.|[^"\\\n])*"|\'(?:\\.|[^\'\\\n])*\'|//[^\n]*|/\*.*?\*/', re.S)
root = pathlib.Path(sys.argv[1])


def lines(*folders):
    files = [file for folder in folders for file in (root / folder).rglob('*.*') if file.suffix in ('.cpp', '.h')]
    bare = (TOKEN.sub(lambda t: '' if t[0].startswith('/') else t[0], file.read_text()) for file in files)
    return sum(bool(line.strip()) for text in bare for line in text.splitlines())


for folder in sys.argv[2:]:
    print(f'{folder} {lines(folder)}')
tests, code = lines('tests', 'fuzz'), lines(*CODE)
print(f'tests {tests} lines, code {code} lines, {100 * tests / code:.0f} %')
