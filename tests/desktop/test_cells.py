"""Many cells at once, and the way to a field by its name."""
import samples
from case import Case
from waiting import wait_for


class ManyCells(Case):
    TEXT = samples.hd_text({'InitList': ['"A", 0, 10, 1', '"A", 100, 0, 2', '"A", 400, 20, 4', '"B", 50, 7, 3']})

    def test_calculate_interpolate_and_fill(self):
        editor = self.open(self.TEXT)
        editor.click_cell(1, 3)
        for _ in range(3):
            editor.press('shift+Down')
        editor.press('ctrl+shift+e')
        self.assertIn('1 cell changes:', editor.box_texts())
        editor.answer()
        self.assertEqual([editor.table().line(n)[2] for n in (1, 2, 3, 4)], ['10', '12.5', '20', '7'])
        editor.press('ctrl+e')
        editor.box()
        editor.type('value/')
        editor.settle(0.6)
        self.assertIn('The formula ends where a number is expected.', editor.box_texts())
        editor.type('2 + initial_q')
        editor.settle(0.6)
        editor.press('Return')
        editor.settle()
        self.assertIn('4 cells changed', editor.status())
        editor.press('ctrl+z')
        editor.menu('Lines', 'Calculate...')
        editor.box()
        editor.press('Escape')
        editor.click_cell(2, 4)
        editor.press('ctrl+d')
        editor.save()
        self.assertEqual(self.saved().records('InitList'),
                         ['"A", 0, 10, 1', '"A", 100, 12.5, 1', '"A", 400, 20, 4', '"B", 50, 7, 3'])
        for _ in range(2):
            editor.press('ctrl+z')
        editor.save()
        self.assertEqual(self.saved().records('InitList'),
                         ['"A", 0, 10, 1', '"A", 100, 0, 2', '"A", 400, 20, 4', '"B", 50, 7, 3'])


class Sums(Case):
    def test_the_sum_goes_with_the_selection(self):
        editor = self.open()
        editor.click_cell(1, 3)
        editor.press('shift+Down')
        wait_for(lambda: 'sum 2.75' in editor.status(), 'the sum of two levels is shown', 3)
        editor.click_cell(3, 4)
        wait_for(lambda: 'selected' not in editor.status(), 'it goes', 3)


class WayToAField(Case):
    def test_by_keyword_and_by_a_name_in_another_language(self):
        editor = self.open(samples.hd_text({'InitList': []}))
        editor.press('ctrl+k')
        editor.box()
        editor.type('theta')
        editor.press('Return')
        editor.settle(0.4)
        self.assertEqual(editor.current_page(), 'Default Values')
        editor.type('0.75')
        editor.press('ctrl+k')  # stores it first
        editor.box()
        editor.type('manning')
        editor.press('Return')
        editor.settle(0.4)
        self.assertEqual(editor.current_page(), 'Bed Resist.')
        editor.save()
        self.assertEqual(self.saved().value('theta'), '0.75')

    def test_from_another_editor(self):
        editor = self.open_project()
        editor.put(1, 2, '1500', leave='Return', table=editor.table('Radius and width'))
        editor.press('ctrl+k')
        editor.box()
        editor.type('theta')
        editor.press('Return')
        editor.settle(0.4)
        self.assertEqual(editor.current_page(), 'Default Values')
        editor.type('0.75')
        editor.save()
        self.assertEqual(self.saved().value('theta'), '0.75')

    def test_to_columns_and_dates(self):
        editor = self.open()
        for words, page in (('initial q', 'Initial'), ('target level', 'Encroachment'), ('storing', 'Maps'),
                            ('width/depth', 'Mixing Coef.'), ('limited output period', 'Time Series Output'),
                            ('initial q', 'Initial')):
            editor.press('ctrl+k')
            editor.box()
            editor.type(words)
            editor.press('Return')
            editor.settle(0.4)
            self.assertEqual(editor.current_page(), page)
        editor.type('7.25')
        editor.save()
        self.assertEqual(self.saved().records('InitList')[0].split(', ')[-1], '7.25')
