"""Programs that write to a file which the shell has open, and an account of what ever stood in it."""
import os
import re
import shutil
import subprocess
import time


class Account:
    """The contents of one file, told apart by numbers in them: which there ever were, and who has seen them go."""

    def __init__(self, folder, name, text, patterns):
        """`patterns`: what stands before each number."""
        shutil.rmtree(folder, ignore_errors=True)
        os.makedirs(f'{folder}/far')
        self.folder, self.path = folder, f'{folder}/{name}'
        self._text, self._patterns = text, [re.compile(rf'(?<={pattern})[\d.]*\d') for pattern in patterns]
        self._next = 1000
        self.theirs, self.settled = set(), set()  # of other programs; those that their writers or the user let go
        self.write(self.path, self.new_text())
        self.settled.add(self.standing())

    def number(self):
        self._next += 1
        return self._next

    def new_text(self):
        """A content that there never was."""
        text = self._text
        for pattern in self._patterns:
            text = pattern.sub(str(self.number()), text, count=1)
        return text

    @staticmethod
    def write(path, text):
        with open(path, 'w', encoding='utf-8', newline='\n') as file:
            file.write(text)

    def identity(self, text):
        """The numbers of a content; None of one that is not whole."""
        found = [pattern.search(text) for pattern in self._patterns]
        whole = text.rstrip().endswith(self._text.rstrip().rsplit('\n', 1)[-1])
        return tuple(float(each.group()) for each in found) if whole and all(found) else None

    def standing(self, path=None):
        """What a file holds; None when it is gone, or cut."""
        try:
            with open(path or self.path, encoding='utf-8', errors='replace') as file:
                return self.identity(file.read())
        except OSError:
            return None

    def files(self):
        return [os.path.join(top, name) for top, _, names in os.walk(self.folder) for name in names]

    def lost(self):
        """What another program wrote, and nobody let go, and is nowhere any more."""
        return self.theirs - self.settled - set(map(self.standing, self.files()))


class OtherPrograms:
    """Each of them does what it does to the file once, and says in a word what that was."""

    def __init__(self, account, random, hdkv=None):
        self._account, self._random, self._hdkv = account, random, hdkv
        self.wrong = []  # answers that are not true
        self.ways = [self.writes_over_it, self.puts_another_in_its_place, self.removes_it, self.touches_it,
                     self.makes_it_a_link] + [self.sets_a_value] * bool(hdkv)

    def act(self):
        return self._random.choice(self.ways)()

    def _let_go(self):
        """Whoever replaces what stands there knows what he does."""
        self._account.settled.add(self._account.standing())

    def writes_over_it(self):
        """As editors do that keep the file: for a while it is cut."""
        text = self._account.new_text()
        self._let_go()
        with open(self._account.path, 'w', encoding='utf-8', newline='\n') as file:
            half = self._random.randrange(len(text))
            file.write(text[:half])
            file.flush()
            time.sleep(self._random.choice((0, 0, 0.05, 0.3)))
            file.write(text[half:])
            file.flush()
            if os.fstat(file.fileno()).st_nlink:  # else the file was replaced before this stood in it
                self._account.theirs.add(self._account.identity(text))
        return f'writes {self._account.identity(text)} over it'

    def _place(self, make):
        text = self._account.new_text()
        other = f'{self._account.folder}/far/{self._account.number()}'
        make(other, text)
        self._let_go()
        self._account.theirs.add(self._account.identity(text))
        os.replace(other, self._account.path)
        return self._account.identity(text)

    def puts_another_in_its_place(self):
        return f'puts {self._place(self._account.write)} in its place'

    def makes_it_a_link(self):
        def make(other, text):
            self._account.write(f'{other}-target', text)
            os.symlink(os.path.join('far', os.path.basename(other) + '-target'), other)

        return f'makes it a link to {self._place(make)}'

    def removes_it(self):
        self._let_go()
        try:
            os.remove(self._account.path)
        except FileNotFoundError:
            pass
        return 'removes it'

    def touches_it(self):
        try:
            os.utime(self._account.path)
        except FileNotFoundError:
            pass
        return 'touches it'

    def sets_a_value(self):
        """hdkv: who says that he has written has, and who says that he has not has not."""
        before, level = self._account.standing(), self._account.number()
        result = subprocess.run([self._hdkv, 'set', self._account.path, 'G_waterlevel', str(level)],
                                capture_output=True, text=True)
        now = self._account.standing()
        if result.returncode == 0 and now and now[-1] == level:
            self._account.theirs.add(now)
            self._account.settled.add(before)
        elif now and now[-1] == level:
            self.wrong.append(f'hdkv ends with {result.returncode} and has written')
        elif result.returncode == 0 and not any(each and each[-1] == level
                                                for each in map(self._account.standing, self._account.files())):
            self.wrong.append(f'hdkv says that {level} is written')
        elif result.returncode not in (0, 1, 2, 3, 4) or (result.returncode and not result.stderr.strip()):
            self.wrong.append(f'hdkv ends with {result.returncode}: {result.stderr}')
        return f'hdkv sets {level}: {result.returncode}'
