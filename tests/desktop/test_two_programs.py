"""Two programs at one file: who comes second looks at it, edits a copy, or waits; a further start hands its files over."""
import os
import subprocess
import time

import case
import samples
from case import Case
from editor import Editor
from waiting import wait_for


class Two(Case):
    def setUp(self):
        super().setUp()
        self.others = []

    def tearDown(self):
        for other in self.others:
            other.end()
        super().tearDown()

    def first(self, *files):
        """A program beside the one under test, which comes after it."""
        os.makedirs(f'{self.folder}/first', exist_ok=True)
        other = Editor(f'{self.folder}/first', *(f'{self.folder}/{name}' for name in files))
        self.others.append(other)
        return other

    def notice(self):
        """What the bar above the view says, with its buttons."""
        labels = [w.name for w in self.editor.frame.all('label') if ' in use ' in w.name]
        return '\n'.join(labels)

    def wait_for_notice(self, words):
        wait_for(lambda: words in self.notice(), f'the bar says {words}; it says {self.notice()}', 12)

    def press_button(self, name):
        self.editor.click(self.editor.field(name, 'push button'))

    def hdkv(self, *arguments):
        return subprocess.run([os.path.join(os.environ['KVR_BIN'], 'hdkv'), *arguments], cwd=self.folder,
                              capture_output=True, text=True)


class ReadOnly(Two):
    def test_second_looks_edits_a_copy_and_takes_over(self):
        samples.write(f'{self.folder}/moor.HDKV', samples.hd_text())
        first = self.first('moor.HDKV')
        editor = self.start('moor.HDKV')
        self.wait_for_notice(f'process {first.process.pid}')
        case.session.picture(f'{self.folder}/in_use.png')
        editor.put(1, 3, '2.5')
        editor.press('ctrl+v', 'Insert', 'ctrl+Insert', 'Delete', 'F2')
        self.assertEqual(editor.table().cell(1, 3).name, '1.25')
        self.assertIn('not changed here', editor.status())
        editor.go_to('Wind')
        self.assertFalse(editor.modified)
        self.assert_no_message()
        # What is only read is nobody's matter.
        self.assertEqual(self.hdkv('get', 'moor.HDKV', 'G_discharge').returncode, 0)
        # The other one ends: what it has saved meanwhile is read.
        editor.go_to('Initial')
        subprocess.run(['xdotool', 'windowactivate', '--sync', first.window_id], check=True)
        first.press('alt+F4')
        wait_for(lambda: first.process.poll() is not None, 'the first program ends')
        self.assertEqual(self.hdkv('set', 'moor.HDKV', 'G_waterlevel', '7.5').returncode, 0)
        self.wait_for_notice('no longer in use')
        self.press_button('Edit')
        wait_for(lambda: not self.notice(), 'the bar goes')
        editor.put(1, 3, '2.5')
        editor.save()
        self.assertEqual(self.saved().records('InitList')[0].split(', ')[2], '2.5')
        self.assertEqual(self.saved().value('G_waterlevel'), '7.5')
        self.assert_no_message()

    def test_a_copy_is_edited(self):
        samples.write(f'{self.folder}/moor.HDKV', samples.hd_text())
        self.first('moor.HDKV')
        editor = self.start('moor.HDKV')
        self.wait_for_notice('Here it can be looked at')
        self.press_button('Edit a Copy...')
        editor.box()
        editor.press('ctrl+a')
        editor.type(f'{self.folder}/moor.HDKV')  # of all names the one that is in use
        editor.press('Return')
        wait_for(lambda: 'is in use by' in '\n'.join(editor.box_texts()), 'the name is refused')
        self.assertIn('Choose another name', '\n'.join(editor.answer()))
        editor.box()
        editor.press('ctrl+a')
        editor.type(f'{self.folder}/copy.HDKV')
        editor.press('Return')
        wait_for(lambda: 'copy.HDKV' in editor.title, 'the window is that of the copy')
        self.assertEqual(self.notice(), '')
        editor.put(1, 3, '2.5')
        editor.save()
        self.assertEqual(self.saved('copy.HDKV').records('InitList')[0].split(', ')[2], '2.5')
        self.assertEqual(self.saved().records('InitList')[0].split(', ')[2], '1.25')

    def test_each_file_of_a_project_and_a_program_that_was_killed(self):
        samples.write_project(self.folder)
        first = self.first('moor.kvnw')
        editor = self.start('moor.kvrp')
        wait_for(lambda: len(editor.windows()) >= 3, 'the project opens its three files')
        self.wait_for_notice('moor.kvnw is in use by')
        self.assertNotIn('moor.HDKV', self.notice())
        editor.put(1, 3, '2.5')
        self.assertTrue(editor.modified)
        editor.put(1, 2, '1500.5', table=editor.table('Radius and width'))
        self.assertIn('not changed here', editor.status())
        first.process.kill()
        self.wait_for_notice('moor.kvnw can be edited now')
        self.press_button('Edit')
        editor.put(1, 2, '1500.5', table=editor.table('Radius and width'))
        editor.save()
        self.assertIn('1500.5', self.saved('moor.kvnw').text)

    def test_hdkv_waits_its_time_and_says_who_has_the_file(self):
        editor = self.open()
        refused = self.hdkv('set', 'moor.HDKV', 'G_waterlevel', '7.5')
        self.assertEqual(refused.returncode, 4, refused.stderr)
        self.assertIn(f'kvrshell, process {editor.process.pid}', refused.stderr)
        editor.press('ctrl+w')
        wait_for(lambda: not editor.windows(), 'the window goes')
        self.assertEqual(self.hdkv('set', 'moor.HDKV', 'G_waterlevel', '7.5').returncode, 0)
        self.assertEqual([name for name in os.listdir(self.folder) if name.endswith('.lock')], [])

    def test_in_japanese(self):
        samples.write(f'{self.folder}/moor.HDKV', samples.hd_text())
        self.first('moor.HDKV')
        self.start('moor.HDKV', language='ja_JP')
        wait_for(lambda: [w for w in self.editor.frame.all('label') if '使用中' in w.name], 'the bar says so', 12)
        case.session.picture(f'{self.folder}/japanese.png')


class OneProgram(Two):
    """A further start hands its files to the program that runs."""

    def start_again(self, *arguments):
        environment = dict(os.environ, XDG_CONFIG_HOME=f'{self.folder}/settings', XDG_STATE_HOME=f'{self.folder}/state')
        return subprocess.Popen([os.path.join(os.environ['KVR_BIN'], 'kvrshell'), *arguments], cwd=self.folder,
                                env=environment, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)

    def test_files_are_handed_over(self):
        samples.write_project(self.folder)
        editor = self.editor = Editor(self.folder, 'moor.HDKV', shared=True)
        again = self.start_again('moor.kvnw')
        self.assertEqual(again.wait(8), 0)
        wait_for(lambda: len(editor.windows()) == 2, 'the second file is opened in the first program')
        # The same file by another name comes to the front.
        os.symlink('moor.HDKV', f'{self.folder}/link.hdkv')
        os.link(f'{self.folder}/moor.HDKV', f'{self.folder}/hard.hdkv')
        for name in ('link.hdkv', 'hard.hdkv'):
            self.assertEqual(self.start_again('moor.kvnw').wait(8), 0)
            wait_for(lambda: 'moor.kvnw' in editor.title, 'the network is in front')
            self.assertEqual(self.start_again(name).wait(8), 0)
            wait_for(lambda: 'moor.HDKV' in editor.title, f'{name} is in front')
        self.assertEqual(len(editor.windows()), 2)

    def test_one_that_hangs_is_not_waited_for_long(self):
        samples.write_project(self.folder)
        editor = self.editor = Editor(self.folder, 'moor.HDKV', shared=True)
        subprocess.run(['kill', '-STOP', str(editor.process.pid)], check=True)
        again = self.start_again('moor.kvnw')
        try:
            time.sleep(4)
            self.assertIsNone(again.poll(), 'it starts by itself')
        finally:
            again.kill()
            again.wait()
            subprocess.run(['kill', '-CONT', str(editor.process.pid)], check=True)
        editor.settle()
        self.assertEqual(len(editor.windows()), 1, 'who has gone is not served any more')
