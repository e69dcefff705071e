"""Texts and numbers are found and replaced in a column, a page, the whole document."""
import samples
from case import Case
from waiting import wait_for

LINES = {'InitList': ['"RHINE", 300, 3, 10', '"ELBE", 100, 1, 11', '"RHINE", 100, 2, 12'],
         'WindList': ['"RHINE", 10, 0.5', '"ELBE", 20, 0.6']}


class FindAndReplace(Case):
    def ask(self, find, replace, where=None):
        editor = self.editor
        editor.press('ctrl+h')
        box = editor.box()
        editor.type(find)
        editor.press('Tab')
        editor.type(replace)
        if where:
            editor.click(box.find('radio button', where))
        return box

    def wait_for_summary(self, box, text):
        shown = lambda: '\n'.join(label.text for label in box.all('label'))
        wait_for(lambda: text in shown(), f'{text} is shown', 5)

    def test_what_is_no_condition_says_how_one_is_written(self):
        editor = self.open(samples.hd_text(LINES))
        editor.click_cell(2, 3)
        box = self.ask('>>2', '1')
        self.wait_for_summary(box, 'Nothing found. Of numbers a condition is 5, >3, <=3, 2..7, =4 or !=4.')
        editor.press('Escape')
        box = self.ask('>500', '1')
        self.wait_for_summary(box, 'Nothing found.')
        self.assertNotIn('condition is', '\n'.join(label.text for label in box.all('label')))
        editor.press('Escape')

    def test_a_range_of_numbers_by_a_formula_in_a_column(self):
        editor = self.open(samples.hd_text(LINES))
        editor.click_cell(2, 3)
        box = self.ask('2..5', '=value*10')
        self.wait_for_summary(box, '2 cells found; 2 would change.')
        editor.click(box.find('push button', 'Replace All'))
        editor.press('Escape')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), ['"RHINE", 300, 30, 10', LINES['InitList'][1], '"RHINE", 100, 20, 12'])
        editor.press('ctrl+z')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES['InitList'])

    def test_a_branch_gets_another_name_in_the_whole_document(self):
        editor = self.open(samples.hd_text(LINES))
        editor.click_cell(1, 1)
        box = self.ask('rhine', 'weser', 'In the whole document')
        self.wait_for_summary(box, '3 cells found; 3 would change.')
        editor.click(box.find('push button', 'Replace All'))
        editor.press('Escape')
        editor.save()
        self.assertEqual(self.saved().records('WindList'), ['"WESER", 10, 0.5', LINES['WindList'][1]])
        self.assertEqual([line.split(',')[0] for line in self.saved().records('InitList')], ['"WESER"', '"ELBE"', '"WESER"'])
        editor.press('ctrl+z')  # one step for all pages
        editor.settle()
        editor.save()
        for name, lines in LINES.items():
            self.assertEqual(self.saved().records(name), lines)

    def test_what_cannot_be_is_listed_and_left(self):
        editor = self.open(samples.hd_text(LINES))
        editor.click_cell(1, 3)
        box = self.ask('>0', 'abc')
        self.wait_for_summary(box, '3 cells found; 0 would change.')
        self.assertFalse(box.find('push button', 'Replace All').enabled)
        editor.press('Escape')
        self.assertFalse(editor.modified)
