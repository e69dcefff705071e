"""A folder with the file that is saved, and what has to hold of it whatever happens."""
import os
import re
import shutil
import stat
import struct

# What a program may leave that is killed or can no longer remove anything: its temporary file and its lock.
OURS = re.compile(r'\.kvr-.*|.*\.lock')
# In the kernel's form: owner rw-, user 1 r--, group r--, mask r--, others ---.
ACCESS_LIST = struct.pack('<I' + 5 * 'HHI', 2, 1, 6, 2**32 - 1, 2, 4, 1, 4, 4, 2**32 - 1, 0x10, 4, 2**32 - 1,
                          0x20, 0, 2**32 - 1)


class Guarded:
    def __init__(self, folder, name, text, linked=False, mode=0o640, passing='$^', other_name=None):
        """`text`: None of a file that is not there yet, and is to be like any new one. `linked`: the name is a symbolic
        link into another folder. `passing`: a pattern of what every run writes otherwise. `other_name`: one that the
        file may get, as long as it has one of both."""
        shutil.rmtree(folder, ignore_errors=True)
        os.makedirs(f'{folder}/far' if linked else folder)
        self.folder = folder
        self._paths = [os.path.join(folder, each) for each in (name, other_name) if each]
        self._target = os.path.join(folder, 'far', name) if linked else None
        self._passing = re.compile(passing)
        with open(self._real, 'w', encoding='utf-8', newline='\n') as file:
            file.write(text or '')
        if text is not None:
            os.chmod(self._real, mode)
            self._set_attributes()
        if linked:
            os.symlink(os.path.join('far', name), self.path)
        self.start_over()
        if text is None:
            os.remove(self._real)
            self.text = None

    @property
    def path(self):
        return next(filter(os.path.lexists, self._paths), self._paths[0])

    @property
    def _real(self):
        return self._target or self.path

    def start_over(self):
        """What is there now is what has to be kept."""
        self.text = self.content()
        self._before = self._metadata()
        self._names = self._listing()

    def belongs_there(self, name):
        """It has been put beside the file, and has to stay."""
        self._names.append(name)

    def _set_attributes(self):
        for name, value in (('user.kept', b'by a save'), ('system.posix_acl_access', ACCESS_LIST)):
            try:
                os.setxattr(self._real, name, value)
            except OSError:  # the file system has none
                pass

    def _metadata(self):
        status = os.stat(self._real)
        return {'mode': stat.filemode(status.st_mode), 'owner': status.st_uid, 'group': status.st_gid,
                'link': os.path.islink(self.path),
                'attributes': {name: os.getxattr(self._real, name) for name in os.listxattr(self._real)}}

    def _listing(self):
        return sorted(os.path.relpath(os.path.join(top, name), self.folder)
                      for top, _, names in os.walk(self.folder) for name in names)

    def content(self):
        with open(self.path, encoding='utf-8', errors='replace', newline='') as file:
            return self._passing.sub('', file.read())

    def _litter(self, may_litter):
        """Names that do not belong there. An empty lock that could not be looked at may be somebody else's, and stays."""
        def is_right(name):
            is_lock = name.endswith('.lock') and os.path.getsize(os.path.join(self.folder, name)) == 0
            return name in names or is_lock or (may_litter and OURS.fullmatch(os.path.basename(name)))

        names = [*self._names, *(os.path.basename(path) for path in self._paths)]
        return [name for name in self._listing() if not is_right(name)]

    def violations(self, new, saved, said='', may_litter=False):
        """What does not hold, as sentences. `new`: what the file holds when it was saved; `saved`: whether the program
        says so, None when it could say nothing; `said`: its words. What of the file's mode, owner and attributes could
        not be kept has to be told."""
        try:
            content = self.content()
        except OSError as error:
            if self.text is not None:
                return [f'the file is gone: {error}']
            content = None
        wrong = []
        if content not in (self.text, new):
            lines = new.splitlines()
            strange = next((line for line in content.splitlines() if line not in lines), 'fewer lines')
            wrong.append(f'neither old nor new content ({len(content)} characters for {len(new)}): {strange}')
        elif saved is not None and (content == new) != saved:
            wrong.append(f'said {"saved" if saved else "not saved"}, the content is {"new" if content == new else "old"}')
        if sum(map(os.path.lexists, self._paths)) > 1:
            wrong.append('it has both of its names')
        now = self._metadata() if content is not None else self._before
        wrong += [f'{what} was {was}, is {now[what]}, and nobody is told' for what, was in self._before.items()
                  if now[what] != was and not said.strip()]
        # What was displaced and could not be looked at is kept, and named.
        if litter := [name for name in self._litter(may_litter)
                      if '.displaced-' not in name or os.path.basename(name) not in said]:
            wrong.append(f'left over: {", ".join(litter)}')
        return wrong
