"""Keys and mouse, as the X server passes them on from real devices. Keeps a log of what was pressed."""
import contextlib
import re
import subprocess
import time

from waiting import wait_for

DOUBLE_CLICK = 0.5  # seconds; two clicks farther apart are two clicks
KEYS = {'\t': 'Tab', '\n': 'Return'}


class Hands:
    def __init__(self):
        self.log = []
        self._clicked = None, 0.0  # where and when last
        self._desktops = 2

    def press(self, *keys, pause=20):
        """Keys by their X names, with what is held: 'Tab', 'ctrl+s', 'shift+F3'. `pause`: milliseconds after each."""
        self.log.append('press ' + ' '.join(keys))
        self._do('key', '--delay', pause, *keys)

    def type(self, text, speed=25):
        """Types text, `speed` milliseconds a key: 10 is a fast typist's burst, 50 an ordinary one's. Tab and line
        feed are the keys."""
        self.log.append(f'type {text!r} at {speed} ms')
        chain = []
        for part in re.split('([\t\n])', text):
            if part in KEYS:
                chain += ['key', '--delay', speed, KEYS[part]]
            elif part:
                chain += ['type', '--delay', speed, '--args', 1, part]
        self._do(*chain)

    def click(self, x, y, button=1, times=1, held=None):
        self.log.append(f'click {x}, {y}' + (f' button {button}' if button != 1 else '') +
                        (f' {times} times' if times != 1 else '') + (f' with {held}' if held else ''))
        # Two clicks at one place are a double click only when that is asked for.
        if self._clicked[0] == (x, y):
            time.sleep(max(0.0, self._clicked[1] + DOUBLE_CLICK - time.monotonic()))
        hold = ['keydown', held] if held else []
        let_go = ['keyup', held] if held else []
        self._do('mousemove', x, y, *hold, 'click', '--repeat', times, '--delay', 40, button, *let_go)
        self._clicked = (x, y), time.monotonic()
        self._let_it_arrive()

    def _let_it_arrive(self):
        """The window manager gets a click first, and on a busy machine keys overtake what it holds back: they would go
        to the widget that had the focus before. It answers requests in their order."""
        self._desktops = 5 - self._desktops
        self._do('set_num_desktops', self._desktops)
        wait_for(lambda: self._answer('get_num_desktops') == str(self._desktops), 'the window manager passes a click on')

    def wheel(self, x, y, down):
        self._do('mousemove', x, y, 'click', 5 if down else 4)

    def wheel_sideways(self, x, y, right):
        self._do('mousemove', x, y, 'click', 7 if right else 6)

    def drag(self, start, end):
        self.log.append(f'drag {start} to {end}')
        self._do('mousemove', *start, 'mousedown', 1)
        for step in range(1, 6):
            self._do('mousemove', *(a + (b - a) * step // 5 for a, b in zip(start, end)))
            time.sleep(0.02)
        self._do('mouseup', 1)
        self._let_it_arrive()

    @contextlib.contextmanager
    def holding(self, key):
        """Keeps a key down meanwhile."""
        self.log.append(f'hold {key}')
        self._do('keydown', key)
        try:
            yield
        finally:
            self._do('keyup', key)

    def rest(self, x, y):
        """Moves the pointer out of the way."""
        self._do('mousemove', x, y)

    @staticmethod
    def _answer(question):
        return subprocess.run(['xdotool', question], capture_output=True, text=True).stdout.strip()

    @staticmethod
    def _do(*arguments):
        subprocess.run(['xdotool', *map(str, arguments)], check=True, stdout=subprocess.DEVNULL,
                       stderr=subprocess.PIPE)
