#!/usr/bin/env python3
"""The syntax highlighting, on the examples: editors_test.py ROOT. Each character of a model has a colour."""
import json
import pathlib
import re
import sys

root = pathlib.Path(sys.argv[1])
grammar = json.loads((root / 'editors/zornet.tmLanguage.json').read_text())
patterns = [(pattern['name'], re.compile(pattern['match'])) for pattern in grammar['patterns']]
vim = (root / 'editors/vim/syntax/zornet.vim').read_text()
kinds = set(re.findall(r'^  \{"(\w+)",', (root / 'network/kinds.cpp').read_text(), re.M))


def parts(line):
    """Scopes with their texts, as an editor finds them: the first match, and of several there the first pattern."""
    place = 0
    while found := min(((m.start(), i, m) for i, (_, p) in enumerate(patterns) if (m := p.search(line, place))), default=0):
        yield '', line[place:found[0]]
        yield patterns[found[1]][0], found[2].group()
        place = found[2].end()
    yield '', line[place:]


colours = {}
for model in root.glob('examples/*.szn'):
    for scope, text in (part for line in model.read_text().splitlines() for part in parts(line)):
        colours.setdefault(scope, set()).add(text)
for scope, text in (part for kind in kinds for part in parts(f'constraint {kind}();')):
    colours.setdefault(scope, set()).add(text)
plain = {text for text in colours.pop('') if text.strip()}
assert not plain, f'without a colour: {plain}'
assert colours['support.function.szn'] == kinds, f'constraints: {colours["support.function.szn"] ^ kinds}'
words = [word for name, pattern in patterns for word in re.findall(r'\w{2,}', pattern.pattern) if '|' in pattern.pattern]
keywords = [word for row in re.findall(r'^syntax keyword \w+ (.*)$', vim, re.M) for word in row.split()]
assert sorted(words) == sorted(keywords), f'{words} are not those of Vim, {keywords}'
