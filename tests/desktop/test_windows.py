"""Windows and their keys."""
import samples
from case import Case
from editor import active_window
from waiting import wait_for


class ClosingKeys(Case):
    """Ctrl+W and Ctrl+F4 close the window in front, whoever has the keyboard."""

    def assert_closes(self, focus, tabs=False):
        editor = self.open_project()
        if tabs:
            editor.menu('Window', 'Tabs')
        for key in ('ctrl+F4', 'ctrl+w'):
            focus(editor)
            editor.settle()
            editor.press(key)
            wait_for(lambda: 'moor.HDKV' not in editor.windows(), f'{key} closes the window')
            if key == 'ctrl+F4':
                editor.menu('File', 'Open Recent', '/moor.HDKV')
                wait_for(lambda: 'moor.HDKV' in editor.windows(), 'the file is open again')
                editor.settle()

    def test_from_a_table(self):
        self.assert_closes(lambda e: e.click_cell(1, 3))

    def test_from_a_cell_being_typed_into(self):
        def type_same(editor):
            editor.click_cell(1, 3)
            editor.press('F2')
        self.assert_closes(type_same)

    def test_from_a_field(self):
        def to_field(editor):
            editor.page('Default Values')
            editor.click(editor.field('Delta'))
        self.assert_closes(to_field)

    def test_from_a_page_tab_among_tabs(self):
        self.assert_closes(lambda e: (e.page('Wind'), e.click(e._tab('Wind'))), tabs=True)

    def test_from_the_other_editors(self):
        editor = self.open_project()
        for key, window, table in (('ctrl+w', 'moor.kvnw', 'Branches of the river network'),
                                   ('ctrl+F4', 'moor.kvxs', 'Cross sections by branch')):
            editor.click(editor.table(table).cell(1, 2))
            editor.press(key)
            wait_for(lambda: window not in self.editor.windows(), f'{key} closes {window}')
        self.assertEqual(self.editor.windows(), ['moor.HDKV'])

    def test_from_the_map(self):
        editor = self.open_project()
        editor.click(editor.frame.find('filler', '^Map of the river network'))
        editor.press('ctrl+w')
        wait_for(lambda: 'moor.kvnw' not in self.editor.windows(), 'Ctrl+W closes the network')


class ClosingProject(Case):
    def test_cancel_leaves_everything(self):
        """All questions come first: Cancel at the last one has closed nothing."""
        editor = self.open_project()
        editor.put(1, 3, '2.5')
        editor.put(1, 2, '1500', leave='Return', table=editor.table('Radius and width'))
        editor.put(1, 2, '12.5', leave='Return', table=editor.table('Points of the current cross section'))
        editor.click_cell(1, 1)
        modified = ['moor.HDKV*', 'moor.kvnw*', 'moor.kvxs*']
        wait_for(lambda: editor.project_files() == modified, 'all files are modified')
        for close, answers in ((lambda: editor.menu('File', 'Close Project'), ('Discard', 'Cancel')),
                               (lambda: editor.menu('File', 'Close Project'), ('Save', 'Discard', 'Cancel')),
                               (lambda: editor.press('ctrl+q'), ('Save', 'Cancel'))):
            close()
            for answer in answers:
                editor.answer(answer)
            self.assert_no_message()
            self.assertEqual(len(editor.windows()), 3)
            self.assertEqual(editor.project_files(), modified)
        self.assertEqual(self.saved().text, samples.hd_text())


class MenuLetters(Case):
    """Alt and a letter of the menu bar opens its menu on every page, in both languages."""

    def test_no_page_shadows_the_menu_bar(self):
        editor = self.open()
        letters = {'File': 'f', 'Edit': 'e', 'Lines': 'l', 'View': 'v', 'Window': 'w', 'Help': 'h'}
        for page in editor.pages():
            editor.go_to(page)
            for menu, letter in letters.items():
                item = next(w for w in editor._menu_bar().children() if w.name == menu)
                if not item.enabled:
                    continue
                editor.press(f'alt+{letter}')
                popup = next(item.children())
                wait_for(lambda: popup.shown, f'Alt+{letter.upper()} opens {menu} on the page {page}', 2)
                editor.press('Escape', 'Escape')
                wait_for(lambda: not popup.shown, f'the menu {menu} closes')


class Help(Case):
    """F1 shows the chapter of the page in front, and the keyboard comes back to where it was."""

    def test_it_opens_searches_and_closes(self):
        editor = self.open()
        editor.go_to('Wind')
        editor.click_cell(1, 3)
        front = active_window()
        editor.press('F1')
        wait_for(lambda: active_window() not in ('', front), 'the help is shown', 5)
        editor.press('ctrl+f')
        editor.type('Latitude')
        editor.press('Return', 'Escape')
        wait_for(lambda: active_window() == front, 'Escape leads back', 5)
        editor.settle()
        editor.type('0.75')
        editor.press('Return')
        editor.save()
        self.assertEqual(self.saved().records('WindList')[0], '"MOORBECK", 100, 0.75')
        self.assert_clean()
