"""A desktop of its own for one run of tests: display, window manager, message bus, home."""
import os
import shutil
import struct
import subprocess
import tempfile
import zlib

from waiting import NotInTime, wait_for


class Session:
    """Starts with the block and ends with it; what is started inside belongs to it through the environment."""

    def __init__(self, size='1600x1000'):
        self._size = size
        self._started = []

    def __enter__(self):
        self.folder = tempfile.mkdtemp(prefix='desktop-')
        for name in ('home', 'run', 'screen'):
            os.mkdir(f'{self.folder}/{name}', mode=0o700)
        os.environ.update(HOME=f'{self.folder}/home', XDG_RUNTIME_DIR=f'{self.folder}/run',
                          XDG_DATA_HOME=f'{self.folder}/home/.local', XDG_CACHE_HOME=f'{self.folder}/home/.cache',
                          LC_ALL='C.UTF-8', ATSPI_NO_CACHE='1', QT_QPA_PLATFORM='xcb',
                          QT_LINUX_ACCESSIBILITY_ALWAYS_ON='1')
        for name in ('QT_STYLE_OVERRIDE', 'QT_SCALE_FACTOR', 'WAYLAND_DISPLAY', 'XDG_CURRENT_DESKTOP'):
            os.environ.pop(name, None)
        # A display of that number may just be going away, and take the new one's socket along.
        for last in (False, False, True):
            try:
                self._start_display()
                break
            except NotInTime:
                if last:
                    raise
        os.environ['DBUS_SESSION_BUS_ADDRESS'] = self._announced('dbus-daemon', '--session', '--nofork',
                                                                 '--print-address', '{}')
        return self

    def _start_display(self):
        # Without auto-repeat a busy machine cannot turn one key into many.
        os.environ['DISPLAY'] = ':' + self._announced('Xvfb', '-displayfd', '{}', '-screen', '0', self._size + 'x24',
                                                      '-nolisten', 'tcp', '-r', '-fbdir', f'{self.folder}/screen')
        self._start('openbox')
        wait_for(lambda: subprocess.run(['xdotool', 'get_desktop'], capture_output=True).returncode == 0,
                 'the window manager answers', 4)

    def __exit__(self, *_):
        for process in reversed(self._started):
            process.terminate()
        for process in self._started:
            try:
                process.wait(5)
            except subprocess.TimeoutExpired:
                process.kill()
                process.wait()
        shutil.rmtree(self.folder, ignore_errors=True)

    def _start(self, *command, **more):
        process = subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL, **more)
        self._started.append(process)
        return process

    def _announced(self, *command):
        """Starts a server that writes its address to the descriptor named by {} once it serves."""
        read, write = os.pipe()
        self._start(*(part.format(write) if part == '{}' else part for part in command), pass_fds=[write])
        os.close(write)
        with os.fdopen(read) as announcement:
            address = announcement.readline().strip()
        if not address:
            raise RuntimeError(f'{command[0]} did not start')
        return address

    def picture(self, path):
        """The screen as a PNG file."""
        width, height, rows = self._screen()
        lines = bytearray()
        for row in rows:
            pixels = bytearray(3 * width)
            pixels[0::3], pixels[1::3], pixels[2::3] = row[2::4], row[1::4], row[0::4]
            lines += b'\0' + pixels

        def chunk(kind, data):
            return struct.pack('>I', len(data)) + kind + data + struct.pack('>I', zlib.crc32(kind + data))

        with open(path, 'wb') as out:
            out.write(b'\x89PNG\r\n\x1a\n' + chunk(b'IHDR', struct.pack('>2I5B', width, height, 8, 2, 0, 0, 0)) +
                      chunk(b'IDAT', zlib.compress(bytes(lines), 3)) + chunk(b'IEND', b''))

    def pixels(self, x, y, width, height):
        """What is painted in a part of the screen."""
        rows = self._screen()[2]
        return b''.join(row[4 * x:4 * (x + width)] for row in rows[y:y + height])

    def _screen(self):
        """The frame buffer, which the X server keeps in a file: four bytes a pixel, blue first."""
        with open(f'{self.folder}/screen/Xvfb_screen0', 'rb') as screen:
            dump = screen.read()
        header = struct.unpack('>25I', dump[:100])
        width, height, line = header[4], header[5], header[12]
        start = header[0] + 12 * header[19]  # behind the header and the colours
        return width, height, [dump[start + y * line:start + y * line + 4 * width] for y in range(height)]
