#!/usr/bin/env python3
"""Runs what a page shows: check.py ROOT BUILD PAGE. Its fenced blocks are, by their kind,

console      commands behind `$ `, each with what it prints below, first on stdout, then on stderr. A line of three dots
             stands for any lines. Times are not compared.
szn, sh      a file for the commands, where a comment at the top of the block is its name
text         a drawing
cpp, cmake   a piece of a source file, word for word

Commands run in a folder of their own beside the examples and docs: `zornet` and `./dev run` are the built program,
`c++` compiles with the flags of the build, and the tree that the install tests made is in $PREFIX.
"""
import json
import os
import pathlib
import re
import shutil
import subprocess
import sys

root, build = (pathlib.Path(argument).resolve() for argument in sys.argv[1:3])
page = root / sys.argv[3]
folder, prefix = build / 'docs-test' / page.stem, build / 'install-test/tree'
SOURCES = ('host', 'vector', 'module', 'single', 'enum', 'network', 'language', 'zornet', 'tests', 'fuzz', 'bench', 'docs',
           'examples', 'editors', 'cmake', 'gdb')
failures = []

shutil.rmtree(folder, ignore_errors=True)
(folder / 'bin').mkdir(parents=True)
for name, command in (('bin/zornet', f'exec {build}/bin/zornet "$@"'), ('bin/c++', 'exec $CXX $CXXFLAGS "$@"'),
                      ('dev', '[ "$1" = run ] && shift && exec zornet "${@:-examples/hello.szn}"')):
    (folder / name).write_text(f'#!/usr/bin/env bash\n{command}\n')
    (folder / name).chmod(0o755)
for name in ('examples', 'docs'):
    (folder / name).symlink_to(root / name)
path = f'{folder}/bin:{os.environ["PATH"]}'
os.environ.update(PATH=path, PREFIX=str(prefix), PKG_CONFIG_PATH=f'{prefix}/lib/pkgconfig')


def without_times(text):
    return re.sub(r'(?<="milliseconds":)[\d.e-]+|[\d.]+(?= ms\b)', '0.1', text).rstrip('\n')


def run(command, expected):
    done = subprocess.run(['bash', '-c', command], cwd=folder, capture_output=True, text=True, timeout=120)
    printed = without_times(done.stdout + done.stderr)
    pattern = '(?s:.*?)'.join(map(re.escape, re.split(r'(?m)^\.\.\.$', without_times(expected))))
    if not re.fullmatch(pattern, printed):
        failures.append(f'$ {command}\n--- the page says\n{expected}--- it prints\n{printed}\n')


def check_block(kind, text):
    if kind == 'console':
        for command, expected in re.findall(r'^\$ (.*)\n((?:(?!\$ ).*\n)*)', text, re.M):
            run(command, expected)
    elif kind in ('szn', 'sh', 'text'):
        for name in re.findall(r'^[%#] ([\w.-]+)$', text, re.M)[:1]:
            (folder / name).write_text(text)
    elif kind in ('cpp', 'cmake'):
        files = [f for place in ('docs', 'module', 'single', 'enum', 'tests') for f in (root / place).rglob('*.*')]
        if not any(text in file.read_text() for file in files if file.suffix in ('.cpp', '.h', '.txt')):
            failures.append(f'This stands in no source file:\n{text}')
    else:
        failures.append(f'A block of an unknown kind: {kind}')


def check_references(text):
    """Links and names lead to files, presets, commands and options are known, and a filter of tests finds some."""
    prose = re.sub(r'^```.*?^```$', '', text, flags=re.M | re.S)
    codes = [code.split() for code in re.findall(r'`([^`]+)`', prose) if code.strip()]
    missing = [link for link in re.findall(r'\]\(([\w./-]+)[)#]', text) if not (page.parent / link).exists()]
    missing += [word for code in codes for word in code if is_file(word) and not find_file(word)]

    presets = {preset['name'] for preset in json.loads((root / 'CMakePresets.json').read_text())['configurePresets']
               if not preset.get('hidden')}
    named = [name for row in re.findall(r'--preset (\w+)|\./dev build (\w+)|`(\w+)` preset|preset `(\w+)`'
                                        r'|[Tt]he (\w+) preset\b|\bits (\w+) build\b|build/(\w+)', text) for name in row if name]
    missing += [f'preset {name}' for name in named if name not in presets | {'docs', 'fuzz'}]
    for listed in re.findall(r'The presets are (.*?)\.\s', text, re.S):
        missing += [f'preset {name}' for name in presets ^ set(re.findall(r'`(\w+)`', listed))]
    usage = (root / 'dev').read_text().split("cat <<'EOT'\n")[1].split('EOT')[0]
    missing += [command for command in re.findall(r'\./dev [a-z-]+', text) if f'{command} ' not in usage]

    helped = set(re.findall(r'(?<![\w-])--?[a-z-]+', subprocess.check_output([build / 'bin/zornet', '--help'], text=True)))
    for code in (code for code in codes if code[0] == 'zornet' or code[0].startswith('-')):
        missing += [f'option {word}' for word in code if re.match('--?[a-eg-z]', word) and word.split('=')[0] not in helped]
    for name in re.findall(r'ctest --preset dev -R (\S+?)`', text):
        if 'Total Tests: 0' in subprocess.check_output(['ctest', '-N', '-R', name], cwd=build, text=True):
            missing.append(f'test {name}')
    failures.extend(f'There is no {what}' for what in missing)


def is_file(word):
    return re.fullmatch(r'(?:[\w.-]+/)+[\w.-]*|[\w.-]+\.(cpp|h|md|py|sh|txt|szn|json|so|cmake|svg|expected)', word)


# By its path or by its name alone; a block of the page may make it. FAMILY stands for any of the families.
def find_file(word):
    word = word.replace('FAMILY', 'order')
    if '/' in word:
        return (root / word).exists() or word.startswith('build/')
    return (folder / word).exists() or (build / 'bin' / word).exists() or any(
        (root / place).is_dir() and any((root / place).rglob(word)) for place in SOURCES) or (root / word).exists()


def check_table(text):
    """A row for every operation of the virtual table, in its order, with what it narrows."""
    table = re.search('^ZORVadSingleString (.*)$', (root / 'tests/module/tables.txt').read_text(), re.M)[1]
    slots = dict.fromkeys(re.findall(r'(?<!\S)\w+', table))
    rows = re.findall(r'^\| `(\w+)\((.*?)\)` \| ([\w-]+)', text, re.M)
    if list(slots) != list(dict.fromkeys(name for name, *_ in rows)):
        failures.append('The rows differ from the virtual table or its order')
    operations = re.findall(r'^  X\(\w+, +(\w+), +(.*)\) *\\?$', (root / 'module/operations.h').read_text(), re.M)
    for name, operands in ((name, operands.split(', ')) for name, operands in operations):
        targets = [at for at, operand in enumerate(operands) if not operand.startswith('const ')]
        for arguments, narrows in ((['z', *filter(None, a.split(', '))], n) for row, a, n in rows if row == name):
            if len(arguments) == len(operands) and narrows != (arguments[targets[0]] if targets else '-'):
                failures.append(f'{name} narrows something else than {narrows}')


def check_picture():
    """What is in the picture of the first example; where it lies is up to fonts and Graphviz."""
    run('zornet -q --svg hello.svg examples/hello.szn', '...')
    parts = re.compile(r'<(?:title|text)[^>]*>([^<]*)|(?:fill|stroke)="(#\w+)"')
    drawn, shown = (parts.findall((where / 'hello.svg').read_text()) for where in (folder, root / 'docs'))
    if drawn != shown:
        failures.append('docs/hello.svg is not the picture of examples/hello.szn')


content = page.read_text()
for block in re.findall(r'^```(\w*)\n(.*?)^```$', content, re.M | re.S):
    check_block(*block)
check_references(content)
if page.name == 'values.md':
    check_table(content)
if 'docs/hello.svg' in content:
    check_picture()
sys.exit('\n'.join(failures) or 0)
