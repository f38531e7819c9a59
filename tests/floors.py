#!/usr/bin/env python3
"""Which folder includes which: floors.py ROOT [--dot]. Fails on an include that points up, or in a circle.

A folder stands on those behind it. --dot prints the picture instead, for Graphviz.
"""
import collections
import pathlib
import re
import sys

BELOW = {'host': (), 'vector': ('host',), 'module': ('host',), 'single': ('module', 'host'),
         'enum': ('single', 'vector', 'module', 'host'), 'network': ('module', 'host'),
         'language': ('network', 'module', 'host'), 'zornet': ('language', 'network', 'module', 'host')}

root = pathlib.Path(sys.argv[1])
arrows, wrong = collections.Counter(), []
for folder, below in BELOW.items():
    for file in sorted((root / folder).glob('*.*')):
        for target in re.findall(r'^#include "(\w+)/', file.read_text(), re.M) if file.suffix in ('.h', '.cpp') else ():
            arrows[folder, target] += folder != target
            if target not in (folder, *below):
                wrong.append(f'{file.relative_to(root)} includes {target}/')
if '--dot' in sys.argv:
    print('digraph floors {', *(f'  {a} -> {b} [label={n}];' for (a, b), n in arrows.items() if n), '}', sep='\n')
sys.exit('\n'.join(wrong) or 0)
