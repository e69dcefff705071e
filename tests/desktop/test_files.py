"""Files that are not as they should be, and where they stand."""
import os
import stat

import samples
from case import Case
from waiting import wait_for


class WrongTypes(Case):
    """Nothing that stands in a file goes without a word."""

    TEXT = samples.hd_text({'MixingCoefList': ['"MOORBECK", 100, 1.0, 20, 0.17, 0.2, 0.05, 0.1, 0.03'],
                            'WaveList': ['"MOORBECK", 100, 200, 2.0']},
                           {'Global_Values': ['G_waterlevel = 3.5', 'iLevelDepth = 1.0', 'G_wave = 2.5',
                                              'G_discharge = "much"']})

    def test_findings_are_listed(self):
        editor = self.open(self.TEXT)
        shown = self.everything_said()
        for finding in ('G_wave', '2.5', 'G_discharge', 'iLevelDepth'):
            self.assertIn(finding, shown)
        editor.answer('Close')
        self.assert_no_message()

    def everything_said(self):
        editor = self.editor
        box = editor.box()
        said = [w.text for role in ('label', 'text', 'list item') for w in box.all(role)]
        for table in box.all('table') + box.all('tree') + box.all('list'):
            said += [child.name for child in table.children()]
        return '\n'.join(said)

    def test_meaning_beyond_doubt_is_taken(self):
        editor = self.open(self.TEXT)
        editor.answer('Close')
        self.assertTrue(editor.field('Water Depth', 'radio button').checked)
        editor.go_to('Wave Approx')
        self.assertEqual(editor.table().cell(1, 4).name, 'Diffusive Wave')

    def test_save_asks_once_and_keeps_the_original(self):
        editor = self.open(self.TEXT)
        editor.answer('Close')
        editor.put(1, 3, '2.5')
        editor.press('ctrl+s')
        self.assertIn('copy beside it', '\n'.join(editor.answer('Yes')))
        wait_for(lambda: not editor.modified, 'the document is saved')
        kept = [f for f in os.listdir(self.folder) if f.lower().startswith('moor.hdkv.')]
        self.assertEqual(len(kept), 1, os.listdir(self.folder))
        self.assertEqual(samples.Saved(f'{self.folder}/{kept[0]}').text, self.TEXT)
        editor.put(1, 3, '2.75')
        editor.save()  # not asked again
        self.assert_no_message()


class Unreadable(Case):
    TEXT = '// KVR parameter file 1\n[KAVO0_HD]\n  [Global_Variables\n'

    def test_bar_says_so(self):
        editor = self.open(self.TEXT)
        self.assert_no_message()
        labels = ' '.join(w.text for w in editor.frame.all('label'))
        self.assertIn('line 3', labels)
        before = self.saved().text
        editor.press('ctrl+s')
        editor.settle()
        if editor.no_message():
            editor.press('Escape')
        self.assertEqual(self.saved().text, before)


    def test_member_of_a_project_says_so_in_the_users_language(self):
        editor = self.open_project(self.TEXT, language='ja_JP')
        self.assert_no_message()
        labels = ' '.join(w.text for w in editor.frame.all('label'))
        self.assertIn('3 行 20 文字目', labels)
        self.assertNotIn('expected', labels)

    def test_members_that_do_not_open_are_told_once(self):
        samples.write_project(self.folder)
        for name in ('moor.kvnw', 'moor.kvxs'):
            samples.write(f'{self.folder}/{name}', '[Other\n')
        self.start('moor.kvrp')
        self.assert_told_once('These files of the project', 'moor.kvnw, line 1, column 7', 'moor.kvxs, line 1, column 7')


class WhereFilesStand(Case):
    """A save renames the entry to the extension in capitals, and that is all it changes about it."""

    def open_river(self):
        editor = self.start('river.hdkv')
        editor.put(1, 3, '2.5')
        editor.save()
        self.assertIn('river.hdkv is now river.HDKV', editor.status())
        self.assertEqual([f for f in os.listdir(self.folder) if f.lower().startswith('river')], ['river.HDKV'])
        return f'{self.folder}/river.HDKV'

    def test_link_stays(self):
        os.mkdir(f'{self.folder}/shared')
        samples.write(f'{self.folder}/shared/target.hdkv', samples.hd_text())
        os.symlink('shared/target.hdkv', f'{self.folder}/river.hdkv')
        path = self.open_river()
        self.assertEqual(os.readlink(path), 'shared/target.hdkv')
        self.assertIn('.target.hdkv.lock', os.listdir(f'{self.folder}/shared'), 'others are kept out as before')
        self.assertEqual(samples.Saved(f'{self.folder}/shared/target.hdkv').records('InitList')[0],
                         '"MOORBECK", 100, 2.5, 10.5')

    def test_mode_stays(self):
        os.chmod(samples.write(f'{self.folder}/river.hdkv', samples.hd_text()), 0o640)
        self.assertEqual(stat.S_IMODE(os.stat(self.open_river()).st_mode), 0o640)


    def test_save_as_leaves_no_twin(self):
        """It takes the place of the file that the user agreed to replace, whatever the case of its extension."""
        samples.write(f'{self.folder}/b.hdkv', '[Other]\n[/Other]\n')
        editor = self.open()
        editor.menu('File', 'Save As')
        editor.box()
        editor.press('ctrl+a')
        editor.type('b.hdkv\n')
        self.assert_told_once('b.hdkv exists already', button='Yes')
        wait_for(lambda: editor.title.startswith('b.HDKV') or 'b.HDKV' in editor.title, 'the new name is shown')
        self.assertEqual(sorted(f for f in os.listdir(self.folder) if f.startswith('b.')), ['b.HDKV'])
        self.assertIn('b.hdkv is now b.HDKV', editor.status())


class WhatASaveDrops(Case):
    def test_what_is_said_outlives_the_dialog(self):
        editor = self.open(samples.hd_text(sections={'MapOutput': ['GenerateOutput = true']}))
        editor.go_to('Maps')
        editor.click_cell(1, 1, editor.table('Map output files'))
        editor.menu('File', 'Save As')
        editor.box()
        editor.press('ctrl+a')
        editor.type('other.HDKV\n')
        wait_for(lambda: 'other.HDKV' in editor.title, 'the new name is shown')
        editor.settle(0.4)
        self.assertIn('Saved', editor.status())

    def test_dropped_lines_are_said(self):
        editor = self.open()
        for _ in range(2):
            editor.click_cell(editor.table().lines, 4)
            editor.press('Tab')
            editor.type('INN\t')
        editor.click_cell(1, 1)
        editor.settle()
        editor.save()
        self.assertIn('2 lines without location dropped', editor.status())
        self.assertEqual(len(self.saved().records('InitList')), 3)

    def test_keys_go_on_from_a_dropped_line(self):
        editor = self.open()
        editor.click_cell(editor.table().lines, 4)
        editor.press('Tab')
        editor.type('INN\t')
        editor.save()
        editor.press('ctrl+End')
        editor.type('77')
        editor.save()
        self.assertEqual(self.saved().records('InitList')[2], '"RIVER10", 300, 1.75, 77')

    def test_levels_of_untitled_marks(self):
        """What nobody has seen is not cleaned; what goes is told before."""
        text = samples.hd_text({'WaterLevelMarkList': ['"MOORBECK", 100, 2, 5.5, 6.5']},
                               {'WaterLevelMarkTitles': ['MarkTitles = 2, "FLOOD", ""',
                                                         'MarkInterpolate = 2, true, false']})
        editor = self.open(text)
        editor.settle(0.5)
        editor.put(1, 3, '2.5')
        editor.save()
        self.assertEqual(self.saved().records('WaterLevelMarkList'), ['"MOORBECK", 100, 2, 5.5, 6.5'])

    def test_visited_pages_of_a_new_file(self):
        """Looking at every page of a new file leaves nothing in it."""
        editor = self.open(samples.hd_text({'InitList': [], 'WindList': []}))
        for page in editor.pages():
            editor.go_to(page)
        editor.go_to('Default Values')
        editor.fill('Delta', '0.75')
        editor.save()
        self.assert_clean()
        saved = self.saved()
        for section in ('OutputGridPoints', 'WLCurveList', 'WLSandBarsList', 'LeakageList', 'InitList'):
            self.assertEqual(saved.records(section), [], section)
