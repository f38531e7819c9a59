#!/usr/bin/env python3
"""The order of the virtual operations, which other modules were compiled against: table_order.py ROOT. Each line of
tables.txt is a class and its operations, overloads with what makes their mangled names differ, as the record of the
binary interface has them; other tests hold that record to the libraries."""
import pathlib
import sys
import xml.etree.ElementTree

root = pathlib.Path(sys.argv[1])
names, bases, slots = {}, {}, {}  # of classes: their names by id; by name their bases' ids, and operations by slot


def take(element, outer):
    for child in element:
        if child.tag == 'class-decl':
            name = outer + child.get('name')
            names[child.get('id')] = name
            bases.setdefault(name, []).extend(base.get('type-id') for base in child.iterfind('base-class'))
            for member in child.iterfind('member-function[@vtable-offset]'):
                slots.setdefault(name, {})[int(member.get('vtable-offset'))] = member.find('function-decl')
            take(child, name + '::')
        elif child.tag in ('abi-instr', 'namespace-decl', 'member-type'):
            take(child, outer)


def table_of(name):
    table = {}
    for base in bases[name]:
        table |= table_of(names[base])
    return table | slots.get(name, {})


def spell(function, all_names):
    name, mangled = function.get('name'), function.get('mangled-name', '')
    if all_names.count(name) == 1:
        return name
    before, _, after = mangled.partition(name)
    return f"{name}:{'const' if before.startswith('_ZNK') else ''}{after}"


for library in ('ZORHost', 'ZORVadStrings'):
    take(xml.etree.ElementTree.parse(root / f'abi/{library}.abi').getroot(), '')
faults = []
for line in (root / 'tests/module/tables.txt').read_text().splitlines():
    name, *expected = line.split()
    table = table_of(name)
    functions = [table[slot] for slot in sorted(table) if not table[slot].get('name').startswith('~')]
    all_names = [function.get('name') for function in functions]
    found = [spell(function, all_names) for function in functions]
    if found != expected:
        faults.append(f'{name} {" ".join(found)}')
sys.exit('\n'.join(faults) or 0)
