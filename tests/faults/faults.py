"""What goes wrong at which file call: one table, for every program. fault_calls.cpp carries it out."""
import errno
import mmap
import struct

ERRORS = ('ENOSPC', 'EIO', 'EDQUOT', 'EACCES', 'EROFS', 'EMFILE', 'EINTR')
KILL, SHORT = 'KILL', 'SHORT'
# A call that is interrupted for ever is repeated for ever.
STICKY = tuple(error for error in ERRORS if error != 'EINTR')
TRANSFERS = ('read', 'write')  # may come back with less than was asked for
_HEAD, _FOLDER, _NAME, _MOST = struct.Struct('<6i'), 236, 24, 4000
_SEEN, _WAITS = 4, 5  # in the head


class Point:
    """The nth file call meets a fault, once or from then on."""

    def __init__(self, number, call, fault, sticky=False):
        self.number, self.call, self.fault, self.sticky = number, call, fault, sticky

    def __str__(self):
        return f'{self.fault} at call {self.number}, {self.call}' + (' and ever after' if self.sticky else '')

    @property
    def kills(self):
        return self.fault == KILL

    def met(self, calls):
        """The point as it came to be, given the calls that were made: a program that looks at its files from time to time
        is not always at the same call."""
        met = calls[self.number - 1] if self.number <= len(calls) else self.call
        return Point(self.number, met, self.fault, self.sticky)

    @property
    def keeps_files(self):
        """Whether the program may be unable to remove what it has made."""
        return self.kills or self.sticky or self.call == 'unlink'

    def code(self):
        return {KILL: -1, SHORT: -2}.get(self.fault) or getattr(errno, self.fault)


def points(calls):
    """Every fault at every call, given the names of the calls."""
    for number, call in enumerate(calls, 1):
        yield Point(number, call, KILL)
        yield from (Point(number, call, error) for error in ERRORS)
        yield from (Point(number, call, error, sticky=True) for error in STICKY)
        if call in TRANSFERS:
            yield Point(number, call, SHORT)
            yield Point(number, call, SHORT, sticky=True)


def told(sentences):
    """Prints what does not hold, for who ends a long run before its time."""
    for sentence in sentences:
        print(sentence, flush=True)
    return sentences


class Orders:
    """The record shared with a program that runs with `environment`."""

    def __init__(self, path, library):
        self._size = _HEAD.size + _FOLDER + _NAME * _MOST
        with open(path, 'wb') as file:
            file.write(bytes(self._size))
        with open(path, 'r+b') as file:
            self._record = mmap.mmap(file.fileno(), self._size)
        self.environment = {'KVR_FAULTS': path, 'LD_PRELOAD': library}

    def arm(self, folder, point=None, waits=0):
        """From now on calls on what is in the folder are counted, and one of them meets its fault; before the one with
        the number `waits` the program waits."""
        self._record[_HEAD.size:_HEAD.size + _FOLDER] = folder.encode().ljust(_FOLDER, b'\0')
        self._record[_HEAD.size + _FOLDER:] = bytes(_NAME * _MOST)
        order = (1, point.number, point.code(), point.sticky) if point else (1, 0, 0, 0)
        self._record[:_HEAD.size] = _HEAD.pack(*order, 0, waits)

    def is_waiting(self):
        head = _HEAD.unpack(self._record[:_HEAD.size])
        return head[_WAITS] != 0 and head[_SEEN] >= head[_WAITS]

    def let_on(self):
        self._record[4 * _WAITS:4 * _WAITS + 4] = bytes(4)

    def disarm(self):
        """The names of the calls since it was armed."""
        seen = _HEAD.unpack(self._record[:_HEAD.size])[_SEEN]
        self._record[:4] = bytes(4)
        names = self._record[_HEAD.size + _FOLDER:]
        return [names[_NAME * i:_NAME * (i + 1)].split(b'\0')[0].decode() for i in range(min(seen, _MOST))]
