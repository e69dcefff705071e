"""What the program tells: its status bar, and everything in the user's language."""
import os
import shutil
import subprocess

import samples
from case import Case
from waiting import wait_for


def copy(text):
    subprocess.run(['xclip', '-selection', 'clipboard'], input=text, text=True, check=True, timeout=10)


class StatusBar(Case):
    def assert_status(self, text):
        wait_for(lambda: text in self.editor.status(), f'the status bar says {text!r}, not {self.editor.status()!r}', 3)

    def test_line_after_paste_and_undo(self):
        editor = self.open()
        editor.click_cell(3, 1)
        copy('INN\t400\t1\t2\nINN\t500\t1\t2\n')
        editor.press('ctrl+v')
        editor.settle()
        self.assertEqual(editor.table().lines, 4)
        self.assert_status('of 4')
        editor.press('ctrl+z')
        self.assert_status('of 3')
        editor.menu('Edit', 'Redo')
        self.assert_status('of 4')

    def test_insertion_and_deletion_are_said(self):
        editor = self.open()
        editor.click_cell(1, 1)
        editor.press('Insert')
        self.assert_status('inserted')
        editor.click_line(2)
        editor.press('Delete')
        self.assert_status('deleted')


class Language(Case):
    def test_japanese_everywhere(self):
        editor = self.open(samples.hd_text(sections={
            'TextOutput': ['LimitedPeriod = true', 'LimitedPeriodStart = 2024, 5, 1, 12, 0, 0',
                           'LimitedPeriodEnd = 2024, 6, 1, 12, 0, 0']}))
        editor.menu('View', 'Language', '日本語')
        english = [page for page in editor.pages() if page.isascii() and 'KLR' not in page]
        self.assertEqual(english, [])
        editor.go_to(editor.pages()[14])
        dates = [w.text for w in editor.frame.all('text') if '2024' in w.text]
        self.assertEqual([date for date in dates if 'May' in date or 'Jun' in date], [])
        self.assertEqual(len(dates), 2)

    def test_names_of_new_documents_follow(self):
        editor = self.open()
        editor.menu('View', 'Language', '日本語')
        editor.press('ctrl+n')
        kinds = editor.box().find('combo box')
        names = [kinds.name] + [w.name for w in kinds.all('list item', hidden=True)]
        self.assertFalse(any(name.isascii() and name for name in names), names)


    def test_reason_of_a_failed_save(self):
        os.mkdir(f'{self.folder}/gone')
        samples.write(f'{self.folder}/gone/moor.HDKV', samples.hd_text())
        editor = self.start('gone/moor.HDKV')
        editor.put(1, 3, '2.5')
        editor.menu('View', 'Language', '日本語')
        shutil.rmtree(f'{self.folder}/gone')
        editor.press('ctrl+s')
        said = '\n'.join(editor.box_texts())
        self.assertIn('moor.HDKV', said)
        self.assertNotIn('No such file', said)
        editor.press('Return')
        editor.settle()
        self.assertTrue(editor.modified)


class Resistance(Case):
    TEXT = samples.hd_text({'BedList': ['"MOORBECK", 100, 40']}, {'Defalt_Values': ['resist_num = 1'],
                                                                 'Global_Values': ['G_resistance = 25']})

    def switch(self):
        editor = self.open(self.TEXT)
        editor.go_to('Bed Resist.')
        editor.click(editor.frame.find('combo box', "Manning's n"))
        editor.press('Up', 'Return')
        return editor.box()

    def test_values_stay_by_default(self):
        self.switch()
        self.editor.press('Return')
        self.assert_no_message()
        self.editor.save()
        self.assertEqual(self.saved().records('BedList')[0].split(', ')[2], '40')
        self.assertEqual(self.saved().value('G_resistance'), '25')

    def test_values_are_converted_in_one_step(self):
        self.switch()
        self.editor.answer('Yes')
        self.editor.save()
        self.assertEqual(self.saved().value('G_resistance'), '0.04')
        self.assertEqual(self.saved().records('BedList')[0].split(', ')[2], '0.025')
        self.editor.menu('Edit', 'Undo')
        self.editor.menu('File', 'Save')
        self.editor.settle()
        self.assertEqual(self.saved().value('G_resistance'), '25')
        self.assertEqual(self.saved().records('BedList')[0].split(', ')[2], '40')


class Browsing(Case):
    TEXT = samples.hd_text(sections={'MapOutput': ['GenerateOutput = true', 'ApplyDemInRiverXsec = false',
                                                   'ApplyDemGroundElevation = true', 'MapAreaGeoDb = true',
                                                   'GeoDb = <>', 'AddToCalculation = false']})

    def browse(self, name):
        editor = self.open(self.TEXT)
        samples.write(f'{self.folder}/grid.dat', 'x')
        editor.go_to('Maps')
        editor.click(editor.frame.find('push button', '^Choose a File'))
        editor.box()
        editor.press('ctrl+a')
        editor.type(f'{self.folder}/{name}\n')
        editor.settle()

    def test_existing_file_is_taken_without_a_question(self):
        self.browse('grid.dat')
        self.assert_no_message()
        self.assertIn('grid.dat', self.editor.field('File name').text)

    def test_missing_file_is_pointed_out(self):
        self.browse('missing.dat')
        self.assertIn('missing.dat', ' '.join(self.editor.box_texts()))
