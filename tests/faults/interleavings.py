#!/usr/bin/python3
"""interleavings.py ROUNDS [SEED [DISPLAYS]]: the shell and other programs at one file, in random order and at one time.

In each round the shell has a file of one of the four kinds open, with real keys, while others write over it, replace,
remove or touch it, make it a link, or set a value by hdkv; in some a second shell opens it, too. What another program
has written never goes unless its writer, or the user, has seen it: it stands in the file, in a copy that is named, or
was loaded. What the shell says about a save is so; in the end it tells a change exactly when there is one; nothing is
left over.

    KVR_BIN=build/dev/bin tests/faults/interleavings.py 100 1 5
"""
import os
import random
import re
import subprocess
import threading
import time

import displays
from other_programs import Account, OtherPrograms

SECONDS = 10.0  # for a save, a notice, an end
# Of each kind: name, table and column of the first line's number, and what stands before each number in the file.
KINDS = {'hd': ('moor.HDKV', 'Local ', 3, [r'"MOORBECK", 100, ', 'G_waterlevel = ']),
         'network': ('moor.kvnw', 'Radius and width', 2, ['DATA = 0, ']),
         'sections': ('moor.kvxs', 'Points of the current cross section', 2, ['Point = 0, '])}
TOLD = re.compile('was changed by another program|was removed or renamed|cannot be read any more')


class Broken(Exception):
    """What has to hold does not."""


class Shell:
    """One program with the file open."""

    def __init__(self, folder, *files, beside=None):
        from editor import Editor

        os.makedirs(folder, exist_ok=True)
        self.editor, self._beside, self.said = Editor(folder, *files), beside, ''

    def front(self):
        if self._beside:
            subprocess.run(['xdotool', 'windowactivate', '--sync', self.editor.window_id], check=True)
            self.editor.settle()

    def notices(self):
        return '\n'.join(label.text for label in self.editor.frame.all('label'))

    def button(self, name):
        return next((each for each in self.editor.frame.all('push button') if each.name == name and each.shown), None)

    def answer(self, choose):
        """Answers what is asked, if something is; gives back the answer."""
        texts = self.editor.no_message()
        if not texts:
            return None
        names = [each.name.replace('&', '') for each in self.editor.box().all('push button')]
        self.said += '\n'.join(texts)
        chosen = choose(names, '\n'.join(texts))
        self.editor.answer(chosen)
        return chosen

    def save(self, choose):
        """Whether the program says that it has saved."""
        self.editor.press('ctrl+s')
        answers, end = [], time.monotonic() + SECONDS
        while time.monotonic() < end:
            if chosen := self.answer(choose):
                answers.append(chosen)
            elif not self.editor.modified or answers:
                break
        else:
            raise Broken('a save neither ends nor says why')
        self.said += self.notices() + self.editor.status()
        return not self.editor.modified and all(each == 'Yes' for each in answers)

    def close(self):
        """By the user; changes are dropped. The exit code."""
        self.front()
        self.editor.press('alt+F4')
        end = time.monotonic() + SECONDS
        while self.editor.process.poll() is None and time.monotonic() < end:
            try:
                self.answer(lambda names, _: 'Discard' if 'Discard' in names else names[0])
            except Exception:  # it went while it was looked at
                time.sleep(0.2)
        return self.editor.process.poll()


class Round:
    def __init__(self, folder, seed, counts):
        import samples

        self.random, self.counts, self.steps = random.Random(seed), counts, []
        texts = {'hd': samples.hd_text, 'network': samples.network_text, 'sections': samples.sections_text}
        self.kind = self.random.choice((*KINDS, 'hd', 'project'))
        self._samples, self._folder = samples, folder
        if self.kind == 'project':
            text = samples.project_text('moor.hdkv', 'extra1000.kvxs')
            self.account = Account(f'{folder}/files', 'moor.kvrp', text, ['File = <extra'])
        else:
            name, table, column, patterns = KINDS[self.kind]
            self._cell = table, column
            self.account = Account(f'{folder}/files', name, texts[self.kind](), patterns)
        hdkv = os.path.join(os.environ['KVR_BIN'], 'hdkv') if self.kind == 'hd' else None
        self.others, self.shells = OtherPrograms(self.account, self.random, hdkv), []
        self.base = self.account.standing()  # what the shell knows of the file

    # ---- what the user does

    def open(self, *files):
        shell = Shell(f'{self._folder}/{len(self.shells)}', *files, beside=self.shells)
        self.shells.append(shell)
        shell.front()
        return shell

    def shown(self, shell):
        return float(shell.editor.table(self._cell[0]).cell(1, self._cell[1]).name)

    def type(self, shell):
        number = self.account.number()
        shell.editor.put(1, self._cell[1], str(number), leave='Return', table=shell.editor.table(self._cell[0]))
        self.steps.append(f'types {number}')

    def choose(self, names, text):
        """The user does not mind, or does."""
        if 'No' not in names:
            return names[0]
        if 'another program has changed' in text.lower():
            self.counts['questions'] += 1
            return self.random.choice(('Yes', 'Yes', 'No'))
        return 'No'

    def save(self, shell, alone=True):
        saved, now = shell.save(self.choose), self.account.standing()
        shown = self.shown(shell)
        self.steps.append(f'saves {shown}: {saved}, {now} stands there')
        self.counts['saves'] += 1
        if saved and alone and (now is None or now[0] != shown):
            raise Broken(f'said to be saved is {shown}')
        if saved:
            mine = [each for each in map(self.account.standing, self.account.files()) if each and each[0] == shown]
            self.base = now if now and now[0] == shown else (shown,)
            self.account.settled.update(mine)

    def offered(self, shell, *names):
        """A button of the bar, which comes soon when the file is another."""
        end = time.monotonic() + 3 * (self.account.standing() != self.base)
        while True:
            button = next(filter(None, map(shell.button, names)), None)
            if button or time.monotonic() >= end:
                return button
            time.sleep(0.1)

    def reload(self, shell):
        button, before = self.offered(shell, 'Reload'), self.account.standing()
        if not button:
            return
        shell.editor.click(button)
        shell.editor.settle()
        shown, after = self.shown(shell), self.account.standing()
        self.steps.append(f'reloads {before}, {after}: {shown}')
        self.counts['reloads'] += 1
        for each in (before, after):
            if each and each[0] == shown and not shell.editor.modified:
                self.base = each
                self.account.settled.add(each)

    def overwrite(self, shell):
        button = self.offered(shell, 'Overwrite', 'Save Again')
        if not button:
            return
        shell.editor.click(button)
        shell.answer(self.choose)
        shown, now = self.shown(shell), self.account.standing()
        self.steps.append(f'overwrites: {now} stands there')
        shell.said += shell.notices()
        self.counts['overwrites'] += 1
        if not shell.editor.modified and now and now[0] == shown:
            self.base = now
            self.account.settled.add(now)

    def keep_both(self, shell):
        """The document is another file's then."""
        button = self.offered(shell, 'Keep Both...')
        if button:
            shell.editor.click(button)
            shell.editor.box()
            shell.editor.press('Return')
            shell.editor.settle()
            self.steps.append('keeps both')
        return bool(button)

    # ---- what has to hold

    def check(self):
        if lost := self.account.lost():
            raise Broken(f'{lost} is lost')
        if self.others.wrong:
            raise Broken('; '.join(self.others.wrong))

    def check_told(self, shell):
        """A change is told exactly when there is one."""
        end, text = time.monotonic() + SECONDS, ''
        while time.monotonic() < end:
            now, text = self.account.standing(), shell.notices()
            if bool(TOLD.search(text)) == (now is None or now[:len(self.base)] != self.base):
                return
            time.sleep(0.3)
        raise Broken(f'{now} stands there, {self.base} is known, and the bar says {text!r}')

    def check_end(self):
        for shell in self.shells:
            if shell.editor.process.poll() is None and (code := shell.close()) != 0:
                raise Broken(f'the shell ends with {code}')
        self.check()
        names = [os.path.basename(each) for each in self.account.files()]
        said = ''.join(shell.said for shell in self.shells)
        for name in names:
            if name.startswith('.kvr-') or name.endswith('.lock'):
                raise Broken(f'left over: {name}')
            if '.displaced-' in name and name not in said:
                raise Broken(f'nobody is told of {name}')
        self.counts['copies'] += sum('.displaced-' in name for name in names)

    def meanwhile(self, action):
        """Another program at the same time, a little earlier or later."""
        def act():
            time.sleep(self.random.choice((0, 0.05, 0.1, 0.2, 0.4)))
            self.steps.append('meanwhile another ' + self.others.act())

        other = threading.Thread(target=act)
        other.start()
        action()
        other.join()

    # ---- rounds

    def one_shell(self):
        shell = self.open(self.account.path)
        for _ in range(self.random.randint(5, 9)):
            step = self.random.choice(('type', 'save', 'save at once', 'other', 'other', 'reload', 'overwrite', 'undo'))
            if step == 'other':
                self.steps.append('another ' + self.others.act())
            elif step == 'save at once':
                self.type(shell)
                self.meanwhile(lambda: self.save(shell, alone=False))
            elif step == 'undo':
                shell.editor.press('ctrl+z')
                shell.editor.settle()
            else:
                getattr(self, step)(shell)
            self.counts['steps'] += 1
            self.check()
            time.sleep(self.random.choice((0, 0.1, 0.4, 2.2)))
        self.check_told(shell)
        if self.random.random() < 0.3 and self.keep_both(shell):
            self.check()

    def two_shells(self):
        """The second one looks until the first has ended."""
        first, path = self.open(self.account.path), self.account.path
        second = self.open(path)
        for _ in range(self.random.randint(2, 4)):
            shell = self.random.choice((first, second))
            shell.front()
            if shell is second:
                before = self.shown(second)
                self.type(second)
                if second.editor.modified or self.shown(second) != before:
                    raise Broken('the second shell changes what the first has')
            else:
                self.type(first)
                self.save(first)
            self.counts['steps'] += 1
            self.check()
        if self.random.random() < 0.5:
            first.editor.process.kill()
        else:
            first.close()
        second.front()
        self.steps.append('the first ends')
        end = time.monotonic() + SECONDS
        while not second.button('Edit') and time.monotonic() < end:
            time.sleep(0.1)
        before = self.account.standing()
        self.meanwhile(lambda: second.editor.click(second.button('Edit')))
        second.editor.settle()
        shown, after = self.shown(second), self.account.standing()
        self.steps.append(f'takes over: {before}, {after}, shows {shown}')
        for each in (before, after):  # it is read when it is taken over
            if each and each[0] == shown:
                self.base = each
                self.account.settled.add(each)
        self.check_told(second)
        self.type(second)
        self.save(second)
        self.check_told(second)

    def project(self):
        """A save of a member writes its name anew into the project, once."""
        self._cell = KINDS['hd'][1:3]
        self._samples.write(f'{self.account.folder}/moor.hdkv', self._samples.hd_text())
        shell = self.open(self.account.path)
        for _ in range(self.random.randint(0, 2)):
            self.steps.append('another ' + self.others.act())
            time.sleep(self.random.choice((0, 0.1, 0.4, 2.2)))
        self.type(shell)
        self.meanwhile(lambda: shell.save(self.choose))
        self.counts['saves'] += 1
        time.sleep(0.3)
        while shell.answer(self.choose):  # what became of the project
            pass
        self.check()
        if self.random.random() < 0.5:
            self.steps.append('another ' + self.others.act())
            self.check()

    def run(self):
        if self.kind == 'project':
            self.project()
        elif self.random.random() < 0.2:
            self.two_shells()
        else:
            self.one_shell()
        self.check_end()

    def end(self):
        for shell in self.shells:
            shell.editor.end()


def run(folder, rounds, seed):
    """Why not all is well, or nothing."""
    counts, broken = dict.fromkeys(('steps', 'saves', 'questions', 'reloads', 'overwrites', 'copies'), 0), 0
    for number in range(rounds):
        each = Round(f'{folder}/{number}', f'{seed}.{number}', counts)
        try:
            each.run()
        except Exception as error:
            broken += 1
            print(f'round {seed}.{number}, {each.kind}: {type(error).__name__}: {error}', *each.steps, sep='\n    ',
                  flush=True)
        finally:
            each.end()
    figures = ', '.join(f'{count} {what}' for what, count in counts.items())
    print(f'display {seed}: {rounds} rounds, {figures}; {broken} broken', flush=True)
    return f'{broken} rounds are broken' if broken else None


if __name__ == '__main__':
    displays.main(run, __file__, __doc__)
