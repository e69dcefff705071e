"""The program is killed and started again: what was typed comes back."""
import glob
import os
import time

import case
import samples
from case import Case
from screen import Table
from waiting import wait_for

WAIT = 12  # seconds, in which what was typed has to be kept


class Recovery(Case):
    def kept(self):
        """What is kept of unsaved changes, by the name of the file; of new documents by their title."""
        texts = {}
        for path in self.recovery_files():
            try:
                with open(path, encoding='utf-8') as file:
                    header, text = file.readline(), file.read()
            except FileNotFoundError:  # it went meanwhile
                continue
            texts[header.split('"file":"')[1].split('"')[0].split('/')[-1] or 'new'] = text
        return texts

    def recovery_files(self):
        return glob.glob(f'{self.folder}/state/KVR/KVR Shell/recovery/*/*.recovery')

    def header(self):
        """The first lines of what is kept."""
        headers = []
        for path in self.recovery_files():
            with open(path, encoding='utf-8') as file:
                headers.append(file.readline())
        return '\n'.join(headers)

    def wait_until_kept(self, name, text):
        wait_for(lambda: text in self.kept().get(name, ''), f'{text} of {name} is kept', WAIT)

    def restart(self, *files):
        """Kills the program and starts it again."""
        editor = self.start(*files, recovers=True)
        wait_for(lambda: editor.box().name == 'Recover Changes', 'the dialog is shown')
        editor.settle()
        return editor

    def lines(self):
        table = Table(self.editor.box().find('table', '^Recover Changes'))
        wait_for(lambda: all('Comparing' not in table.line(n)[2] for n in range(1, table.lines + 1)),
                 'each line says what differs')
        return {table.line(n)[0]: (n, table.line(n)[2]) for n in range(1, table.lines + 1)}

    def choose(self, name, button):
        editor = self.editor
        dialog = editor.box()
        table = Table(dialog.find('table', '^Recover Changes'))
        editor.click(table.cell(self.lines()[name][0], 1))
        editor.click(dialog.find('push button', f'^{button}'))

    def test_every_kind_of_document(self):
        editor = self.open_project()  # a date that a file lacks is none, and no change
        level, radius = 'Points of the current cross section', 'Radius and width'
        editor.put(1, 3, '2.625')
        editor.put(1, 2, '1500.5', leave='Return', table=editor.table(radius))
        editor.put(1, 2, '12.875', leave='Return', table=editor.table(level))
        changed = {'moor.HDKV': '2.625', 'moor.kvnw': '1500.5', 'moor.kvxs': '12.875'}
        for name, text in changed.items():
            self.wait_until_kept(name, text)
        before = {name: self.saved(name).text for name in changed}

        editor = self.restart('moor.kvrp')
        self.assertEqual({name: what for name, (_, what) in self.lines().items()},
                         {name: 'Sections: 1; values changed: 1.' for name in changed})
        for name in changed:
            self.choose(name, 'Open')
        self.assert_no_message()
        wait_for(lambda: len(editor.windows()) == 3, 'the project opens its three files')
        self.assertEqual({name: self.saved(name).text for name in changed}, before, 'nothing is saved yet')
        shown = {'moor.HDKV': lambda: editor.table().cell(1, 3).name,
                 'moor.kvnw': lambda: editor.table(radius).cell(1, 2).name,
                 'moor.kvxs': lambda: editor.table(level).cell(1, 2).name}
        tables = {'moor.HDKV': lambda: editor.table(), 'moor.kvnw': lambda: editor.table(radius),
                  'moor.kvxs': lambda: editor.table(level)}
        for name, text in changed.items():
            wait_for(lambda: shown[name]() == text, f'{name} shows {text}')
            editor.click_cell(1, 2, tables[name]())
            self.assertTrue(editor.modified, name)
            editor.press('ctrl+z')
            wait_for(lambda: shown[name]() != text and not editor.modified, f'undo shows the file {name}')
            editor.press('ctrl+y')
            wait_for(lambda: shown[name]() == text, f'redo shows {text}')
            editor.save()
            self.assertIn(text, self.saved(name).text)
        wait_for(lambda: not self.kept(), 'nothing is kept of what is saved')

    def test_discard_and_later(self):
        editor = self.open()
        editor.put(1, 3, '2.625')
        self.wait_until_kept('moor.HDKV', '2.625')
        self.restart()
        self.choose('moor.HDKV', 'Later')
        self.assert_no_message()
        editor = self.restart('moor.HDKV')
        self.choose('moor.HDKV', 'Discard')
        editor.answer('Discard')
        self.assert_no_message()
        self.assertEqual(editor.table().cell(1, 3).name, '1.25')
        self.assertFalse(editor.modified)
        self.start('moor.HDKV', recovers=True)
        self.assert_no_message()

    def test_a_new_document(self):
        editor = self.start()
        editor.press('ctrl+n')
        editor.box()
        editor.press('Return')  # the first kind
        wait_for(lambda: editor.windows(), 'a document is open')
        editor.settle()
        editor.put(1, 1, 'INN')
        editor.put(1, 2, '1234.5')
        self.wait_until_kept('new', '1234.5')
        editor = self.restart()
        [name] = self.lines()
        self.choose(name, 'Open')
        self.assert_no_message()
        self.assertEqual(editor.table().line(1)[:2], ['INN', '1234.5'])
        self.assertTrue(editor.modified)

    def test_a_file_that_is_another_now(self):
        editor = self.open()
        editor.put(1, 3, '2.625')
        self.wait_until_kept('moor.HDKV', '2.625')
        other = samples.hd_text({'InitList': ['"INN", 5, 6, 7']})
        samples.write(f'{self.folder}/moor.HDKV', other)
        editor = self.restart()
        self.assertIn('The file has been changed since', self.lines()['moor.HDKV'][1])
        self.choose('moor.HDKV', 'Open')
        self.assertIn('moor (recovered)', editor.title)
        self.assertEqual(editor.table().cell(1, 3).name, '2.625')
        self.assertEqual(self.saved().text, other)
        editor.press('ctrl+s')
        editor.box()
        editor.press('Return')  # a free name beside that file is proposed
        wait_for(lambda: 'moor-2.HDKV' in editor.title and not editor.modified, 'the changes stand beside the file')
        self.assert_no_message()
        self.assertIn('2.625', self.saved('moor-2.HDKV').records('InitList')[0])
        self.assertEqual(self.saved().text, other)

    def test_what_cannot_be_kept_is_told_until_it_can(self):
        notice = '^Recovery after a crash does not work'
        editor = self.open()
        folder = f'{self.folder}/state/KVR/KVR Shell'
        os.makedirs(folder, exist_ok=True)
        samples.write(f'{folder}/recovery', 'no folder')
        editor.put(1, 3, '2.625')
        label = editor.frame.find('label', notice, seconds=WAIT)
        self.assertIn('The changes to moor.HDKV cannot be kept', label.description)
        editor.put(1, 3, '2.75')
        self.assertTrue(label.shown)
        os.remove(f'{folder}/recovery')
        self.wait_until_kept('moor.HDKV', '2.75')
        wait_for(lambda: not editor.frame.all('label', notice), 'the notice goes')
        self.assert_no_message()

    def test_what_stands_in_an_open_cell_or_field(self):
        editor = self.open()
        editor.put(1, 3, '4242.5', leave=None)
        self.wait_until_kept('moor.HDKV', '4242.5')
        self.assertFalse(editor.modified, 'nothing has been entered')
        editor.type('25')  # nobody closed it
        self.wait_until_kept('moor.HDKV', '4242.525')
        editor = self.restart('moor.HDKV')
        self.assertEqual(self.lines()['moor.HDKV'][1], 'Sections: 1; values changed: 1.')
        self.choose('moor.HDKV', 'Open')
        wait_for(lambda: editor.table().cell(1, 3).name == '4242.525', 'what was typed is shown')
        editor.press('ctrl+z')
        wait_for(lambda: editor.table().cell(1, 3).name == '1.25' and not editor.modified, 'undo leads to the file')
        editor.fill('Discharge', '17.5.3', leave=None)
        wait_for(lambda: '17.5.3' in self.header(), 'what is no value is kept', WAIT)
        self.restart('moor.HDKV')
        self.assertEqual(self.lines()['moor.HDKV'][1],
                         'Nothing differs.\nTyped but not entered, as it is no value: Discharge: 17.5.3')
        case.session.picture(f'{self.folder}/typed.png')
        self.choose('moor.HDKV', 'Discard')
        self.editor.answer('Discard')

    def test_a_folder_of_another_name_and_files_of_one_name(self):
        for folder in ('a', 'b'):
            os.makedirs(f'{self.folder}/{folder}')
            samples.write(f'{self.folder}/{folder}/moor.HDKV', samples.hd_text())
        editor = self.start('b/moor.HDKV')
        editor.put(1, 3, '2.625')
        self.wait_until_kept('moor.HDKV', '2.625')
        os.rename(f'{self.folder}/b', f'{self.folder}/c')
        editor.press('ctrl+s')
        editor.answer('Yes')  # it cannot be written; under another name?
        editor.box()
        editor.press('ctrl+a')
        editor.type(f'{self.folder}/c/moor.HDKV\n')
        editor.answer('Yes')  # replace it
        wait_for(lambda: not editor.modified, 'it is saved where it stands now')
        self.assertIn('2.625', samples.Saved(f'{self.folder}/c/moor.HDKV').records('InitList')[0])
        self.assert_no_message()
        editor.put(1, 3, '2.75')
        self.wait_until_kept('moor.HDKV', '2.75')
        editor = self.restart('a/moor.HDKV')
        editor.press('Escape')  # Later
        editor.put(1, 3, '2.875')
        wait_for(lambda: len(self.recovery_files()) == 2, 'both are kept', WAIT)
        for language in ('ja_JP', None):
            self.editor = self.start(language=language, recovers=True)
            self.editor.box()
            case.session.picture(f'{self.folder}/names_{language}.png')
        self.assertEqual(sorted(self.lines()), [f'moor.HDKV in {self.folder}/{each}' for each in 'ac'])

    def test_a_list_of_what_was_not_taken_comes_after_it(self):
        text = samples.hd_text({'InitList': ['"MOORBECK", 100, 1.25, 10.5', '"MOORBECK", 200, "high", 10.5']})
        editor = self.open(text)
        editor.box()
        editor.press('Escape')  # the list
        editor.put(1, 3, '2.625')
        self.wait_until_kept('moor.HDKV', '2.625')
        for answer in ('Escape', 'alt+o'):  # Later; Open
            editor = self.restart('moor.HDKV')
            time.sleep(1)
            self.assertEqual(editor.box().name, 'Recover Changes', 'alone')
            editor.press(answer)
            wait_for(lambda: 'Values Not Taken' in editor.box().name, 'the list comes, with the keyboard')
            editor.press('Escape')
            self.assert_no_message()
        wait_for(lambda: editor.table().cell(1, 3).name == '2.625', 'it was opened')

    def test_a_clean_end_leaves_nothing(self):
        editor = self.open()
        editor.put(1, 3, '2.625')
        self.wait_until_kept('moor.HDKV', '2.625')
        editor.press('ctrl+w')
        editor.answer('Discard')
        wait_for(lambda: not self.kept(), 'nothing is kept of what was discarded')
        editor.press('ctrl+q')
        wait_for(lambda: editor.process.poll() is not None, 'the program ends')
        self.assertEqual(os.listdir(f'{self.folder}/state/KVR/KVR Shell/recovery'), [])
        editor.end()
        self.editor = None
