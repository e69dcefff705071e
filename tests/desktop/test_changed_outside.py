"""Another program writes to files that are open: it is told at once, the user chooses, and nothing is lost."""
import os
import re
import subprocess
import time

import samples
from case import Case
from screen import Table
from waiting import wait_for

CHANGED = 'was changed by another program'
FIRST = '"MOORBECK", 100, 1.25, 10.5'  # of the initial conditions in every sample


class Outside(Case):
    def path(self, name='moor.HDKV'):
        return f'{self.folder}/{name}'

    def write(self, old=FIRST, new='"MOORBECK", 100, 7.5, 10.5', name='moor.HDKV'):
        """Another program writes to the file itself."""
        text = self.saved(name).text
        self.assertIn(old, text)
        samples.write(self.path(name), text.replace(old, new))

    def replace(self, value):
        """Another program puts another file in the place of this one."""
        other = samples.write(self.path('other.HDKV'), self.saved().text)
        subprocess.run([os.path.join(os.environ['KVR_BIN'], 'hdkv'), 'set', other, 'G_waterlevel', value], check=True)
        os.replace(other, self.path())

    def notices(self):
        return '\n'.join(label.text for label in self.editor.frame.all('label'))

    def wait_told(self, *words):
        for word in words:
            wait_for(lambda: word in self.notices(), f'{word!r} stands above the view')

    def wait_untold(self, word=CHANGED):
        wait_for(lambda: word not in self.notices(), f'{word!r} stands there no longer')

    def choose(self, name):
        self.editor.click(self.editor.frame.find('push button', f'^{re.escape(name)}$'))
        self.editor.settle()

    def level(self):
        return self.editor.table().cell(1, 3).name

    def kept(self):
        return sorted(name for name in os.listdir(self.folder) if '.displaced-' in name or '-2' in name)

    def test_reload_is_a_step_to_undo(self):
        editor = self.open()
        editor.click_cell(2, 4)  # MOORBECK, 200
        self.write(new='"MOORBECK", 100, 7.5, 10.5\nDATA = "INN", 50, 1, 2')
        self.wait_told(CHANGED, 'moor.HDKV', 'Reload takes the file')
        self.assertEqual(self.level(), '1.25', 'what is shown stays')
        self.choose('Reload')
        wait_for(lambda: self.level() == '7.5', 'the file is shown')
        self.wait_untold()
        self.assertFalse(editor.modified)
        editor.type('9.25')  # the focus and the cell are where they were, on the same line
        editor.press('Return')
        wait_for(lambda: editor.table().line(3) == ['MOORBECK', '200', '1.5', '9.25'], 'its line has what is typed')
        editor.press('ctrl+z')
        wait_for(lambda: not editor.modified, 'undo takes it back')
        editor.press('ctrl+z')
        wait_for(lambda: self.level() == '1.25', 'undo brings back what was shown')
        self.assertTrue(editor.modified)
        editor.save()
        self.assert_no_message()
        self.assertEqual(self.saved().records('InitList')[0], FIRST)
        editor.press('ctrl+y')
        wait_for(lambda: self.level() == '7.5' and editor.modified, 'redo shows the file as it was')
        time.sleep(1)
        self.assertNotIn(CHANGED, self.notices(), 'a save of ours is no news')
        self.assertEqual(self.kept(), [])

    def test_only_the_content_counts(self):
        editor = self.open()
        editor.settle(0.5)
        text = self.saved().text
        os.utime(self.path())
        os.replace(samples.write(self.path('same'), text), self.path())
        os.remove(self.path())
        samples.write(self.path(), text)
        time.sleep(1.5)
        self.assertNotIn('another program', self.notices())
        self.replace('8.25')
        self.wait_told(CHANGED)
        samples.write(self.path(), text)
        self.wait_untold()
        self.replace('8.25')
        self.wait_told(CHANGED)
        os.remove(self.path())
        self.wait_told('was removed or renamed by another program')
        self.choose('Save Again')
        self.wait_untold('another program')
        self.assertEqual(self.saved().value('G_waterlevel'), '3.5')
        self.assertFalse(editor.modified)

    def test_overwrite_and_keep_both(self):
        editor = self.open()
        editor.put(1, 3, '2.625')
        self.replace('8.25')
        self.wait_told(CHANGED, 'the changes made here are not saved')
        theirs = self.saved().text
        self.choose('Overwrite')
        self.assert_no_message()
        self.wait_told('moor.HDKV.displaced-1')
        self.wait_untold(CHANGED)
        self.assertFalse(editor.modified)
        self.assertIn('2.625', self.saved().records('InitList')[0])
        self.assertEqual(samples.Saved(self.path('moor.HDKV.displaced-1')).text, theirs)

        editor.put(1, 3, '2.75')
        self.replace('9.5')
        self.wait_told(CHANGED)
        theirs = self.saved().text
        self.choose('Keep Both...')
        editor.box()
        editor.press('Return')
        wait_for(lambda: 'moor-2.HDKV' in editor.title and not editor.modified, 'the document is the copy')
        self.wait_untold(CHANGED)
        self.assertEqual(self.saved().text, theirs)
        self.assertIn('2.75', self.saved('moor-2.HDKV').records('InitList')[0])
        self.write('9.5', '9.75')
        time.sleep(1)
        self.assertNotIn(CHANGED, self.notices(), 'it is no file of ours any more')

    def test_compare_and_a_file_that_is_none(self):
        editor = self.open()
        self.write()
        self.wait_told(CHANGED)
        self.choose('Compare...')
        table = Table(editor.box().find('table', '^Changes of moor.HDKV'))
        self.assertEqual([table.line(n) for n in range(1, table.lines + 1)],
                         [['InitList', 'DATA', '1', '3', '1.25', '7.5']])
        editor.answer('Close')
        samples.write(self.path(), '// KVR parameter file 1\n[KAVO0_HD]\n  [Global_Variables\n')
        time.sleep(1)
        self.choose('Reload')
        self.wait_told('cannot be loaded as it is', 'line 3')
        self.assertEqual(self.level(), '1.25')
        self.choose('Compare...')
        self.assert_told_once('the file cannot be read')
        editor.press('ctrl+s')  # nothing tells the file by name but what was said above
        self.assertIn('displaced-1', '\n'.join(editor.answer('Yes')))
        self.wait_untold(CHANGED)
        self.assertEqual(self.kept(), ['moor.HDKV.displaced-1'])

    def test_while_a_cell_is_open(self):
        editor = self.open()
        editor.put(1, 3, '2.5', leave=None)
        self.write()
        self.wait_told(CHANGED)
        editor.type('5')  # into the cell
        self.choose('Reload')
        wait_for(lambda: self.level() == '7.5', 'the file is shown')
        editor.press('ctrl+z')
        wait_for(lambda: self.level() == '2.55', 'undo brings back what was typed')
        editor.put(1, 3, 'wrong', leave=None)
        self.write('7.5', '8.5')
        self.wait_told(CHANGED)
        self.editor.click(editor.frame.find('push button', '^Reload$'))
        self.assert_told_once('wrong')
        editor.press('Escape')
        self.assertEqual(self.level(), '2.55')

    def test_a_file_that_is_gone_is_asked_for(self):
        editor = self.open()
        editor.settle(0.6)
        removed = 'was removed or renamed by another program'
        for key in ('ctrl+F4', 'ctrl+w', 'ctrl+q'):
            os.remove(self.path())
            self.wait_told(removed)
            self.assertFalse(editor.modified)
            editor.press(key)
            self.assertIn(removed, '\n'.join(editor.answer('Cancel')))
            self.assertEqual(self.level(), '1.25', 'it is open still')
            self.choose('Save Again')
            self.wait_untold('another program')
        os.remove(self.path())
        self.wait_told(removed)
        editor.press('ctrl+w')
        editor.box()
        editor.press('Return')  # Save
        wait_for(lambda: not editor.windows(), 'the window closes')
        self.assertEqual(self.saved().records('InitList')[0], FIRST)
        self.assert_no_message()

    def test_something_else_in_the_place_of_the_file(self):
        editor = self.open()
        editor.settle(0.6)
        os.remove(self.path())
        os.mkdir(self.path())
        self.wait_told('cannot be read any more')
        self.assertFalse(editor.modified)
        editor.press('ctrl+w')
        self.assertIn('nowhere else', '\n'.join(editor.answer('Cancel')))
        self.assertEqual(self.level(), '1.25', 'it is open still')
        os.rmdir(self.path())
        self.wait_told('was removed or renamed by another program')
        self.choose('Save Again')
        self.wait_untold('another program')
        self.assertEqual(self.saved().records('InitList')[0], FIRST)

    def test_each_kind_in_a_project(self):
        editor = self.open_project()
        editor.settle(0.6)
        radius, points = 'Radius and width', 'Points of the current cross section'
        self.write('1000, 30', '1750.5, 30', 'moor.kvnw')
        self.wait_told('moor.kvnw ' + CHANGED)
        self.choose('Reload')
        wait_for(lambda: editor.table(radius).cell(1, 2).name == '1750.5', 'the network shows its file')
        self.write('Point = 0, 10', 'Point = 0, 13.5', 'moor.kvxs')
        self.wait_told('moor.kvxs ' + CHANGED)
        self.choose('Reload')
        wait_for(lambda: editor.table(points).cell(1, 2).name == '13.5', 'the cross sections show theirs')
        self.assertNotIn(CHANGED, self.notices())
        os.remove(self.path('moor.kvrp'))
        samples.write(self.path('moor.kvrp'), samples.project_text('moor.HDKV', 'moor.kvnw', 'new.kvxs'))
        wait_for(lambda: 'has been read again' in editor.status(), 'the status bar says so')
        self.assertEqual(editor.project_files(), ['moor.HDKV', 'moor.kvnw', 'new.kvxs (missing)'])
        text = self.saved('moor.kvrp').text
        samples.write(self.path('moor.kvrp'), '[KVR_PROJECT]\n[Members]\n')
        wait_for(lambda: 'cannot be read' in editor.status(), 'so is a file that is damaged')
        samples.write(self.path('moor.kvrp'), text)
        wait_for(lambda: 'can be read again' in editor.status(), 'and one that has been put back')
        self.assertEqual(len(editor.windows()), 3)

    def test_japanese(self):
        editor = self.open(language='ja_JP')
        self.write()
        self.wait_told('ほかのプログラム')
        buttons = [b.name for b in editor.frame.all('push button')]
        self.assertIn('再読み込み', buttons)
        self.assertNotIn('Overwrite', buttons)
