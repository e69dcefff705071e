"""Pasting tables of other programs."""
import samples
from case import Case
from test_telling import copy
from waiting import wait_for


LINES = ['"A", 0, 10, 1', '"A", 100, 20, 2', '"B", 50, 7, 3']


class Pasting(Case):
    TEXT = samples.hd_text({'InitList': LINES})

    def test_what_does_not_fit_is_shown_mended_and_undone(self):
        editor = self.open(self.TEXT)
        copy('Initial Q [l/s]\tRiver Name\tChainage\tInitial h\n'
             '500\ta\t0\t1.234,5\n2.500\tA\t100\t21,5\n1\tc\tten\t8,5\n')
        editor.click_cell(1, 1)
        editor.press('ctrl+v')
        self.assertIn('3 lines were copied. 0 lines are new.', editor.box_texts())
        editor.press('Escape')
        editor.press('ctrl+v')
        editor.box()
        editor.press('alt+g', 'End')  # by place
        editor.settle(0.5)
        self.assertIn('3 lines were copied. 0 lines are new.', editor.box_texts())  # nobody knows where ten is
        editor.press('Tab', 'Tab', 'Tab', 'Tab')  # the headers, the columns, what is understood, what does not fit
        editor.press('ctrl+Home', 'Right', 'Right', 'F2')
        editor.press('ctrl+a')
        editor.type('7,25')
        editor.press('Return')
        editor.settle(0.5)
        editor.press('Return')
        editor.settle()
        self.assertIn('12 cells pasted', editor.status())
        editor.save()
        self.assertEqual(self.saved().records('InitList'),
                         ['"A", 0, 1234.5, 0.5', '"A", 100, 21.5, 2.5', '"B", 50, 7, 3', '"C", 7.25, 8.5, 0.001'])
        editor.press('ctrl+z')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES)

    def test_units_below_headers_blank_lines_and_what_is_left_out(self):
        editor = self.open(self.TEXT)
        copy('River Name\tChainage\tInitial h\tInitial Q\n\tkm\tcm\tl/s\n'
             'A\t0\t100\t500\n\nB\t0,05\t2x\t250\n\t100\t3\t4\n')
        editor.click_cell(1, 1)
        editor.menu('Edit', 'Paste with Preview')
        editor.box()
        editor.press('alt+g', 'End')  # by place
        editor.settle(0.5)
        editor.press('alt+l')
        editor.settle(0.3)  # the box is pressed as if by a mouse
        editor.press('Return')
        editor.settle()
        self.assertIn('7 cells pasted; left out: 1 line, 1 cell', editor.status())
        editor.save()
        self.assertEqual(self.saved().records('InitList'), ['"A", 0, 1, 0.5', '"A", 100, 20, 2', '"B", 50, 7, 0.25'])
        editor.press('ctrl+z')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES)

    def test_values_travel_through_a_change_of_units(self):
        editor = self.open(self.TEXT)
        editor.click_cell(1, 3)
        editor.press('shift+Down', 'shift+Right', 'ctrl+c')
        editor.menu('View', 'Units', 'US Customary')
        editor.click_cell(2, 3)
        editor.press('ctrl+v')
        editor.settle()
        self.assertIn('4 cells pasted', editor.status())
        editor.save()
        self.assertEqual(self.saved().records('InitList'), ['"A", 0, 10, 1', '"A", 100, 10, 1', '"B", 50, 20, 2'])

    def test_a_further_table_of_a_page_says_what_was_left_out(self):
        editor = self.open(self.TEXT)
        editor.go_to('Time Series Output')
        editor.click(editor.field('Generate time series', role='check box'))
        table = editor.table('Items')
        copy('Water level\tWL1\nNonsense\tQ1\n')
        editor.click_cell(1, 1, table)
        editor.press('ctrl+v')
        editor.box()
        editor.press('alt+l')
        editor.settle(0.3)
        editor.press('Return')
        wait_for(lambda: '3 cells pasted; left out: 1 cell' in editor.status(), 'the status bar says so', 3)

    def test_a_number_without_unit_is_one_in_the_preview_too(self):
        editor = self.open(samples.hd_text({'WindList': ['"A", 100, 0.5', '"A", 200, 0.6']}))
        editor.go_to('Wind')
        copy('27\n')
        editor.click_cell(1, 3)
        editor.press('ctrl+shift+v')
        editor.box()
        editor.press('Return')
        editor.settle()
        editor.save()
        self.assertEqual(self.saved().records('WindList'), ['"A", 100, 27', '"A", 200, 0.6'])
