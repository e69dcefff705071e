"""Leaving a field, a cell, a page, a window: what was typed is stored, or refused once and in view."""
import samples
from case import Case
from waiting import wait_for

SIX_LINES = samples.hd_text({'InitList': [f'"MOORBECK", {100 * n}, {n}.25, {n}.5' for n in range(1, 7)],
                             'WindList': [f'"MOORBECK", {100 * n}, 0.{n}' for n in range(1, 7)],
                             'BedList': ['"MOORBECK", 100, 31', '"MOORBECK", 200, 32'],
                             'QSSContractionExpansionList': ['"MOORBECK", 100, 0.11, 0.31']},
                            {'Quasi_steady': ['EnergyEquation = true, 0', 'G_ContractExpansion = 0.15, 0.35']})


class EmptiedCell(Case):
    """An emptied cell of a column with a global value takes the global value."""

    def assert_global_after(self, leave, back='Initial'):
        self.open(SIX_LINES)
        self.editor.empty(2, 3)
        leave()
        self.assert_no_message()
        if back:
            self.editor.go_to(back)
        self.assertEqual(self.editor.table().cell(2, 3).name, '3.5')
        self.editor.save()
        self.assertEqual(self.saved().records('InitList')[1], '"MOORBECK", 200, 3.5, 2.5')

    def test_tab_clicked(self):
        self.assert_global_after(lambda: self.editor.page('Wind'))

    def test_page_key(self):
        self.assert_global_after(lambda: self.editor.press('ctrl+Next'))

    def test_save(self):
        self.assert_global_after(lambda: self.editor.press('ctrl+s'), back=None)

    def test_menu(self):
        self.assert_global_after(lambda: self.editor.menu('File', 'Save'), back=None)

    def test_close(self):
        editor = self.open(SIX_LINES)
        editor.empty(2, 3)
        editor.press('ctrl+F4')
        editor.answer('Save')
        wait_for(lambda: not editor.windows(), 'the window closes')
        self.assertEqual(self.saved().records('InitList')[1], '"MOORBECK", 200, 3.5, 2.5')

    def test_other_pages(self):
        editor = self.open(SIX_LINES)
        for page, table, column in (('Wind', 'Local', 3), ('Bed Resist.', '', 3), ('Quasi Steady', '', 3),
                                    ('Quasi Steady', '', 4)):
            editor.go_to(page)
            editor.empty(1, column, editor.table(table))
            editor.page('Initial')
            self.assert_no_message()
        editor.save()
        saved = self.saved()
        self.assertEqual(saved.records('WindList')[0], '"MOORBECK", 100, 0.9')
        self.assertEqual(saved.records('BedList')[0].split(', ')[2], saved.value('G_resistance'))
        self.assertEqual(saved.records('QSSContractionExpansionList')[0], '"MOORBECK", 100, 0.15, 0.35')


class BadText(Case):
    """Text that cannot be stored is told once, with its field, and nothing changes until it is mended."""

    def setUp(self):
        super().setUp()
        self.editor = self.open()

    def assert_field_waits(self):
        """The field is in view with what was typed, and has the focus: digits go into it and nowhere else."""
        editor = self.editor
        self.assertEqual(editor.current_page(), 'Default Values')
        others = {w.name: w.text for w in editor.frame.all('text') if w.name != 'Delta'}
        editor.type('77')
        editor.settle()
        self.assertIn('77', editor.field('Delta').text)
        self.assertEqual({w.name: w.text for w in editor.frame.all('text') if w.name != 'Delta'}, others)

    def spoil_field(self, text='abc', leave=None):
        self.editor.go_to('Default Values')
        self.editor.fill('Delta', text, leave=leave)

    def test_field_then_tab_key(self):
        self.spoil_field(leave='Tab')
        self.assert_told_once('Invalid floating point number!', 'Delta', 'abc', '0.5', '1')
        self.assert_field_waits()

    def test_field_then_tab_clicked(self):
        self.spoil_field()
        self.editor.page('Wind')
        self.assert_told_once('Invalid floating point number!', 'Delta', 'abc', '0.5', '1')
        self.assert_field_waits()

    def test_field_then_page_key(self):
        self.spoil_field('7')
        self.editor.press('ctrl+Next')
        self.assert_told_once('Floating-point value is out of range', 'Delta', '7', '0.5', '1')
        self.assert_field_waits()

    def test_field_then_save(self):
        before = self.saved().text
        self.spoil_field()
        self.editor.press('ctrl+s')
        self.assert_told_once('Invalid floating point number!', 'Delta', 'abc')
        self.assertEqual(self.saved().text, before)
        self.assert_field_waits()
        self.editor.fill('Delta', '0.75', leave=None)
        self.editor.save()
        self.assertEqual(self.saved().value('delta'), '0.75')

    def test_change_then_field_then_save(self):
        """The mark of a modified document stays when its save is refused."""
        self.editor.put(1, 3, '2.5')
        self.spoil_field()
        self.editor.press('ctrl+s')
        self.assert_told_once('Invalid floating point number!')
        self.assertTrue(self.editor.modified)
        self.assertEqual(self.saved().records('InitList')[0], '"MOORBECK", 100, 1.25, 10.5')

    def test_field_then_close(self):
        self.spoil_field()
        self.editor.press('ctrl+F4')
        self.assert_told_once('Invalid floating point number!', 'Delta', 'abc')
        self.assertEqual(self.editor.windows(), ['moor.HDKV'])
        self.assert_field_waits()

    def test_field_then_end_of_program(self):
        self.spoil_field()
        self.editor.press('ctrl+q')
        self.assert_told_once('Invalid floating point number!', 'Delta', 'abc')
        self.assert_field_waits()

    def assert_cell_waits(self):
        self.assertEqual(self.editor.current_page(), 'Initial')
        self.editor.press('ctrl+a')
        self.editor.type('2.5\t')
        self.editor.settle()
        self.assert_no_message()
        self.assertEqual(self.editor.table().line(1), ['MOORBECK', '100', '2.5', '10.5'])

    def spoil_cell(self, leave=None):
        self.editor.put(1, 3, 'x', leave=leave)

    def test_cell_then_tab_key(self):
        self.spoil_cell(leave='Tab')
        self.assert_told_once('Floating point number required', 'x')
        self.assert_cell_waits()

    def test_cell_then_other_cell(self):
        self.spoil_cell()
        self.editor.click_cell(3, 2)
        self.assert_told_once('Floating point number required', 'x', 'Initial h', 'm')
        self.assert_cell_waits()

    def test_cell_then_tab_clicked(self):
        self.spoil_cell()
        self.editor.page('Wind')
        self.assert_told_once('Floating point number required', 'x')
        self.assert_cell_waits()

    def test_cell_then_save(self):
        before = self.saved().text
        self.spoil_cell()
        self.editor.press('ctrl+s')
        self.assert_told_once('Floating point number required', 'x')
        self.assertEqual(self.saved().text, before)
        self.assert_cell_waits()

    def test_cell_then_close(self):
        self.spoil_cell()
        self.editor.press('ctrl+F4')
        self.assert_told_once('Floating point number required', 'x')
        self.assertEqual(self.editor.windows(), ['moor.HDKV'])
        self.assert_cell_waits()

    def test_integer_then_save(self):
        editor = self.editor
        editor.go_to('Encroachment')
        editor.fill('Maximum number', 'abc', leave=None)
        editor.press('ctrl+s')
        self.assert_told_once('abc', 'Maximum number of iterations')
        editor.press('Escape')
        wait_for(lambda: editor.field('Maximum number').text == '20', 'Escape reverts the field')
        editor.page('Initial')
        self.assert_no_message()
        self.assertEqual(editor.current_page(), 'Initial')

    def assert_box_waits(self, box, *ways):
        """A box that is clicked, or reached by its letter, changes nothing before the text beside it is mended."""
        editor = self.editor
        before = editor.field(box, 'check box').checked
        for way in ways:
            way()
            self.assert_told_once('bad')
            self.assertEqual(editor.field(box, 'check box').checked, before)
        editor.press('Escape')
        editor.click(editor.field(box, 'check box'))
        wait_for(lambda: editor.field(box, 'check box').checked != before, 'the box is changed')
        self.assert_no_message()

    def test_field_then_box(self):
        editor = self.editor
        editor.go_to('Wind')
        box = 'Include wind'
        editor.fill('Topographical Factor', 'bad', leave=None)
        self.assert_box_waits(box, lambda: editor.click(editor.field(box, 'check box')), lambda: editor.press('alt+i'))

    def test_cell_then_box(self):
        editor = self.editor
        editor.go_to('Wind')
        editor.put(1, 3, 'bad', leave=None)
        box = 'Include wind'
        self.assert_box_waits(box, lambda: editor.press('alt+i'), lambda: editor.click(editor.field(box, 'check box')))

    def test_cell_then_buttons(self):
        editor = self.editor
        editor.go_to('Encroachment')
        editor.click(editor.field('Add', 'push button'))
        headers = [h.name for h in editor.table('').children_until('table column header')]
        editor.put(1, 1 + headers.index('Left position'), '9x', leave=None, table=editor.table(''))
        for _ in range(2):
            editor.press('alt+d')
            self.assert_told_once('9x')

    def test_integer_then_buttons(self):
        """An integer that waits for the page does not wait for what the page's buttons do."""
        editor = self.editor
        editor.go_to('Encroachment')
        editor.click(editor.field('Add', 'push button'))
        editor.fill('Maximum number', 'abc', leave=None)
        for way in (lambda: editor.click(editor.field('Delete', 'push button')), lambda: editor.press('alt+t'),
                    lambda: editor.press('alt+a')):
            way()
            self.assert_told_once('abc', 'Maximum number')
            self.assertEqual(editor.table('').lines, 2)
        editor.press('Escape')
        wait_for(lambda: editor.field('Maximum number').text == '20', 'Escape reverts the field')


class WhileTyping(Case):
    """Commands that come while a cell is being typed into lose nothing of it."""

    def test_commands(self):
        editor = self.open(SIX_LINES)
        for line, (key, close) in enumerate([('ctrl+g', 'Escape'), ('F7', 'Escape'), ('F3', None)], 1):
            editor.put(line, 3, f'7.{line}', leave=None)
            editor.press(key)
            editor.settle()
            if close:
                editor.box()
                editor.press(close)
            elif editor.no_message():  # there is nothing to search for yet
                editor.press('Escape')
            editor.settle()
            editor.click_cell(6, 4)
            self.assertEqual(editor.table().cell(line, 3).name, f'7.{line}', f'after {key}')
        editor.save()
        self.assertEqual([r.split(', ')[2] for r in self.saved().records('InitList')[:3]], ['7.1', '7.2', '7.3'])

    def test_bad_text_stops_a_command(self):
        editor = self.open(SIX_LINES)
        editor.put(1, 3, 'x', leave=None)
        editor.press('ctrl+g')
        self.assert_told_once('Floating point number required', 'x')
        editor.press('Escape')
        wait_for(lambda: editor.table().cell(1, 3).name == '1.25', 'Escape takes back what was typed')

    def test_other_window(self):
        """A click into another window does what a click on a tab does."""
        editor = self.open_project()
        editor.page('Default Values')
        editor.fill('Delta', 'abc', leave=None)
        editor.click(editor.table('Branches of the river network').cell(2, 2))
        self.assert_told_once('Invalid floating point number!', 'Delta', 'abc')
        editor.press('ctrl+a')
        editor.type('0.75\t')
        editor.fill('NoIter', '1x', leave=None)  # waits for the page, and so for the window
        editor.click(editor.table('Branches of the river network').cell(2, 2))
        self.assert_told_once('NoIter', '1x')
        self.assertIn('moor.HDKV', editor.title)
        editor.press('Escape')
        editor.go_to('Initial')
        editor.empty(2, 3)
        editor.click(editor.table('Branches of the river network').cell(2, 2))
        self.assert_no_message()
        editor.click_cell(1, 1)
        editor.save()
        self.assertEqual(self.saved().value('delta'), '0.75')
        self.assertEqual(self.saved().records('InitList')[1].split(', ')[2], '3.5')

    def assert_borders_leave_the_cell_open(self, table, line, column):
        """Whoever drags a column's border, or double-clicks it, goes on typing in the open cell."""
        editor = self.editor
        header = [h for h in editor.table(table).children_until('table column header')][column - 1]
        before = editor.table(table).cell(line, column).name
        for end, expected in (('Escape', before), ('Return', '123')):
            x, y, width, height = header.place
            border = x + width - 1, y + height // 2
            editor.put(line, column, '1', leave=None, table=editor.table(table))
            editor.hands.drag(border, (border[0] + 25, border[1]))
            wait_for(lambda: header.place[2] > width + 15, 'the column is wider')
            editor.type('2')
            editor.hands.click(border[0] + 25, border[1], times=2)
            editor.settle()
            editor.type('3')
            editor.press(end)
            wait_for(lambda: editor.table(table).cell(line, column).name == expected, f'{expected} after {end}')
        self.assert_no_message()

    def test_column_made_wider(self):
        editor = self.open_project()
        editor.page('Initial')
        self.assert_borders_leave_the_cell_open('Local ', 2, 3)
        editor.save()
        self.assertEqual(self.saved().records('InitList')[1], '"MOORBECK", 200, 123, 11')
        self.assert_borders_leave_the_cell_open('Radius and width', 2, 1)
