"""Files that tests open: small, and written here, so that a case says what is in them."""
import json
import os
import re
import subprocess

BRANCHES = {'MOORBECK': 9850, 'RIVER10': 5000, 'INN': 4000}  # and their lengths


def hd_text(lists=None, sections=None):
    """An HD parameter file: `lists` gives the DATA lines of lists, `sections` the lines of global sections."""
    given = {'Global_Values': ['G_waterlevel = 3.5', 'G_discharge = 12', 'G_wind_factor = 0.9'],
             'Defalt_Values': ['struc_fac = 0.26'], **(sections or {})}
    lists = {'InitList': ['"MOORBECK", 100, 1.25, 10.5', '"MOORBECK", 200, 1.5, 11', '"RIVER10", 300, 1.75, 11.5'],
             'WindList': ['"MOORBECK", 100, 0.5', '"RIVER10", 400, 0.6'], **(lists or {})}
    lines = ['// KVR parameter file 1', '[KAVO0_HD]', '[Global_Variables]']
    for section, content in given.items():
        lines += [f'[{section}]', *content, f'[/{section}]']
    lines.append('[/Global_Variables]')
    for name, records in lists.items():
        lines += [f'[{name}]', *(f'DATA = {record}' for record in records), f'[/{name}]']
    return '\n'.join([*lines, '[/KAVO0_HD]', ''])


def network_text(branches=None):
    lines = ['// KVR parameter file 1', '[KVR_NETWORK]']
    for row, (name, length) in enumerate((branches or BRANCHES).items()):
        y = 5690000 + 1000 * row
        lines += ['[Branch]', f'Name = "{name}"', f'Chainage = 0, {length}', 'FlowsDownstream = true', '[Line]',
                  f'Vertex = 500000, {y}', f'Vertex = {500000 + length}, {y}', '[/Line]',
                  '[Channel]', 'DATA = 0, 1000, 30', f'DATA = {length}, 1000, 40', '[/Channel]', '[/Branch]']
    return '\n'.join([*lines, '[/KVR_NETWORK]', ''])


def sections_text():
    lines = ['// KVR parameter file 1', '[KVR_CROSS_SECTIONS]']
    for chainage in (0, 1000, 2000):
        lines += ['[CrossSection]', 'Branch = "MOORBECK"', 'TopoID = "T1"', f'Chainage = {chainage}', 'Radius = 1000',
                  'Width = 30', '[Profile]', 'Point = 0, 10', 'Point = 5, 8', 'Point = 12, 8', 'Point = 17, 10',
                  '[/Profile]', '[/CrossSection]']
    return '\n'.join([*lines, '[/KVR_CROSS_SECTIONS]', ''])


def project_text(*members):
    return '\n'.join(['// KVR parameter file 1', '[KVR_PROJECT]', '[Members]', *(f'File = <{m}>' for m in members),
                      '[/Members]', '[/KVR_PROJECT]', ''])


def write(path, text):
    with open(path, 'w', encoding='utf-8', newline='\n') as file:
        file.write(text)
    return path


def write_project(folder, hd=None, branches=None):
    """A project of one file of each kind; gives its path."""
    write(f'{folder}/moor.HDKV', hd or hd_text())
    write(f'{folder}/moor.kvnw', network_text(branches))
    write(f'{folder}/moor.kvxs', sections_text())
    return write(f'{folder}/moor.kvrp', project_text('moor.HDKV', 'moor.kvnw', 'moor.kvxs'))


class Record(str):
    """A record as it is written. It equals the values of its first columns: others may be added behind them."""

    def __eq__(self, first):
        values = first.split(', ')
        return self.split(', ')[:len(values)] == values

    __hash__ = str.__hash__


def misread(path):
    """What the project's own tool finds in a file but for its values: they may be odd in a test."""
    checked = subprocess.run([os.path.join(os.environ['KVR_BIN'], 'hdkv'), 'check', '--format', 'json', path],
                             capture_output=True, text=True)
    if checked.returncode > 1:
        return [checked.stderr]
    findings = json.loads(checked.stdout)['files'][0]['findings']
    return [finding for finding in findings if finding['code'] <= 'HD102']


class Saved:
    """What stands in a saved file."""

    def __init__(self, path):
        with open(path, encoding='utf-8') as file:
            self.text = file.read()

    def value(self, keyword):
        """The parameters of a keyword as they are written, or None."""
        found = re.search(rf'^\s*{re.escape(keyword)} = ?(.*)$', self.text, re.M)
        return found and found.group(1)

    def records(self, section):
        """The records of a list as they are written."""
        found = re.search(rf'^\s*\[{section}\]\n(.*?)^\s*\[/{section}\]', self.text, re.M | re.S)
        written = re.findall(r'^\s*(?:DATA|data) = (.*)$', found.group(1), re.M) if found else []
        return [Record(record) for record in written]


def same_name(folder, name):
    """The path of a file in whatever case its name is spelt."""
    found = [entry for entry in os.listdir(folder) if entry.lower() == name.lower()]
    assert len(found) == 1, f'{name} among {os.listdir(folder)}'
    return os.path.join(folder, found[0])
