"""What a field or a cell takes, and the keys of tables."""
import subprocess

import samples
from case import Case
from screen import State

CURVES = ['"MOORBECK", 100, 1, 2, 3, 4', '"MOORBECK", 200, 1, 2, 3, 4', '"MOORBECK", 300, 1, 2, 3, 4']


def clipboard():
    return subprocess.run(['xclip', '-selection', 'clipboard', '-o'], capture_output=True, text=True,
                          timeout=10).stdout


class Numbers(Case):
    def test_rounded_text_typed(self):
        """What is really typed is stored, also when it is what the field shows rounded."""
        editor = self.open()
        editor.go_to('Default Values')
        self.assertEqual(editor.field('Struc Fac').text, '0.3')
        editor.fill('Struc Fac', '0.3')
        editor.save()
        self.assertEqual(self.saved().value('struc_fac'), '0.3')

    def test_passed_through(self):
        """What nobody types keeps its last bit."""
        editor = self.open()
        editor.go_to('Default Values')
        editor.click(editor.field('Struc Fac'))
        editor.press('Tab', 'shift+Tab', 'Tab')
        editor.fill('Delta', '0.75')
        editor.save()
        self.assertEqual(self.saved().value('struc_fac'), '0.26')

    def test_escape_reverts(self):
        editor = self.open()
        editor.go_to('Default Values')
        for name, shown in (('MaxIterSteady', '100'), ('Delta', '0.5')):
            editor.fill(name, 'abc', leave='Escape')
            self.assertEqual(editor.field(name).text, shown)
        editor.page('Wind')
        self.assert_no_message()
        self.assertFalse(editor.modified)


class LockedCells(Case):
    def test_typing_there_is_told(self):
        """Who types on with Tab would put what follows into other columns."""
        editor = self.open(samples.hd_text({'BedList': ['"MOORBECK", 100, 30, 31, 32, 33']},
                                           {'Global_Values': ['ResisZone = 1, 30, 25, 20']}))
        editor.go_to('Bed Resist.')
        editor.click_cell(1, 2)
        editor.press('Tab')
        editor.type('0.5', speed=10)
        self.assert_told_once('The cell is locked.', 'Resistance, line 1: "0" was typed.')
        editor.press('Tab')
        editor.type('0.75\t')
        editor.save()
        self.assertEqual(self.saved().records('BedList'), ['"MOORBECK", 100, 30, 0.75, 32, 33'])


class BranchNames(Case):
    def test_typed_name_is_not_completed(self):
        editor = self.open_project()
        for line, typed in ((1, 'moor'), (2, 'river1'), (3, 'in')):
            editor.put(line, 1, typed, speed=10)
            self.assert_no_message()
        editor.save()
        self.assertEqual([r.split(',')[0] for r in self.saved().records('InitList')], ['"MOOR"', '"RIVER1"', '"IN"'])

    def test_offer_taken_on_purpose(self):
        editor = self.open_project()
        editor.put(3, 1, 'moo', leave=None)
        editor.settle(0.2)
        editor.press('Down', 'Return')
        editor.settle()
        editor.press('Tab')
        editor.save()
        self.assertEqual(self.saved().records('InitList')[2].split(',')[0], '"MOORBECK"')

    def test_all_names_of_an_emptied_cell(self):
        editor = self.open_project()
        editor.click_cell(1, 1)
        editor.press('F2', 'BackSpace', 'alt+Down')
        editor.settle(0.4)
        self.assertFalse(editor.modified, 'the cell is still being edited')
        editor.press('Down', 'Return')
        editor.settle(0.4)
        editor.press('Tab')
        editor.save()
        self.assertEqual(self.saved().records('InitList')[0].split(',')[0], '"RIVER10"')


class Dates(Case):
    PERIOD = samples.hd_text(sections={
        'TextOutput': ['LimitedPeriod = true', 'LimitedPeriodStart = 2024, 5, 1, 12, 0, 0',
                       'LimitedPeriodEnd = 2024, 6, 1, 12, 0, 0']})

    def assert_taken(self, language, *texts):
        editor = self.open(self.PERIOD, language=language)
        editor.go_to(editor.pages()[14])  # whatever the language calls it
        for text, stored in texts:
            field = editor.frame.all('text')[2]
            editor.click(field)
            editor.press('ctrl+a')
            editor.type(text)
            editor.press('Tab')
            self.assert_no_message()
            editor.save()
            self.assertEqual(self.saved().value('LimitedPeriodStart'), stored, f'{text} in {language}')

    def test_american(self):
        self.assert_taken('en_US', ('5/31/24 6:00 PM', '2024, 5, 31, 18, 0, 0'),
                          ('5/30/2024 18:00', '2024, 5, 30, 18, 0, 0'),
                          ('5/29/2024', '2024, 5, 29, 0, 0, 0'), ('2024-05-28T06:30:15', '2024, 5, 28, 6, 30, 15'),
                          ('2024-05-27 06:30', '2024, 5, 27, 6, 30, 0'))

    def test_japanese(self):
        self.assert_taken('ja_JP', ('2024/5/31 6:00', '2024, 5, 31, 6, 0, 0'),
                          ('2024-05-28T06:30:15', '2024, 5, 28, 6, 30, 15'))

    def test_unchecked_box_reverts(self):
        editor = self.open(self.PERIOD)
        editor.go_to('Time Series Output')
        shown = editor.field('Start').text
        editor.fill('Start', '31.31.2024', leave=None)
        box = editor.field('Limited output period', 'check box')
        editor.click(box)
        if editor.no_message():
            editor.press('Return')
            editor.settle()
        if box.checked:
            editor.click(box)
        self.assert_no_message()
        self.assertFalse(editor.field('Start').enabled)
        self.assertEqual(editor.field('Start').text, shown)
        editor.page('Initial')
        self.assert_no_message()
        self.assertEqual(editor.current_page(), 'Initial')


class TableKeys(Case):
    def test_disabled_table_is_left_alone(self):
        editor = self.open_project(samples.hd_text({'WLCurveList': CURVES}))
        editor.go_to('W. L. Incr. - Curves')
        table = editor.table('Water level increment')
        self.assertFalse(table.enabled)
        lines = table.lines
        for entry in ('Delete Line', 'Insert Line'):
            editor.menu('Lines', entry)
            editor.press('Escape', 'Escape')  # a greyed entry leaves its menu open
            editor.settle()
        editor.press('ctrl+l', 'Insert', 'Delete')
        editor.settle()
        if editor.no_message():
            editor.press('Return')
        self.assertEqual(editor.table('Water level increment').lines, lines)
        self.assertFalse(editor.modified)

    def test_copy_after_undo(self):
        editor = self.open()
        editor.click_line(2)
        editor.press('Delete')
        editor.click_cell(1, 3)
        editor.press('ctrl+z')
        editor.settle()
        table = editor.table()
        cells = [table.cell(line, column) for line in range(1, 4) for column in range(1, 5)]
        current = [cell.name for cell in cells if cell.has(State.FOCUSED)]
        editor.press('ctrl+c')
        editor.settle()
        self.assertEqual([clipboard().strip()], current)

    def test_delete_needs_line_numbers(self):
        """Selected cells, though they are all of their lines, are no selected lines."""
        editor = self.open()
        table = editor.table()
        editor.hands.drag(table.cell(1, 1).middle, table.cell(2, 4).middle)
        editor.press('Delete')
        editor.settle()
        self.assertEqual(editor.table().lines, 3)
        editor.click_line(2)
        editor.press('Delete')
        editor.settle()
        table = editor.table()
        self.assertEqual([table.cell(line, 2).name for line in range(1, table.lines + 1)], ['100', '300'])

    def test_held_control_keeps_one_section_selected(self):
        """Another window's current section is one section, whatever key is held here."""
        editor = self.open_project(samples.hd_text({'InitList': [f'"MOORBECK", {n}, 1, 2' for n in (0, 1000, 2000)]}))
        editor.click_cell(3, 1)
        editor.settle(0.2)
        with editor.hands.holding('ctrl'):
            editor.press('Up')
            editor.settle(0.3)
            sections = editor.table('Cross sections by branch and chainage')
            selected = [line for line in range(1, 4) if sections.cell(line, 1).selected]
        self.assertEqual(selected, [2])


class Search(Case):
    LINES = samples.hd_text({'InitList': [*(f'"MOORBECK", {n}, 1, 2' for n in range(1, 5)), '"RIVER10", 5, 1, 2'],
                             'WindList': ['"MOORBECK", 1, 0.5', '"RIVER10", 2, 0.6', '"MOORBECK", 3, 0.6']})

    def search(self, name):
        self.editor.press('F7')
        self.editor.box()
        self.editor.press('ctrl+a')
        self.editor.type(name + '\n')
        self.editor.settle()

    def test_any_case(self):
        editor = self.open(self.LINES)
        editor.click_cell(1, 1)
        self.search('river10')
        self.assert_no_message()
        self.assertIn('Line 5', editor.status())

    def test_next_page_starts_at_its_own_top(self):
        editor = self.open(self.LINES)
        editor.click_cell(1, 1)
        self.search('RIVER10')
        self.assertIn('Line 5', editor.status())
        editor.page('Wind')
        editor.click_cell(1, 1)
        editor.press('F3')
        self.assert_no_message()
        self.assertIn('Line 2', editor.status())
