"""Branch and chainage stay in sight while a table scrolls sideways, under real keys and the mouse."""
import samples
from case import Case
from waiting import wait_for

MARKS = 40
TITLES = [f'M{mark}' for mark in range(1, MARKS + 1)]
PLACES = [('RHINE', 300), ('ELBE', 100), ('RHINE', 100), ('ELBE', 50)]


class FrozenColumns(Case):
    def open_marks(self, **more):
        levels = ', '.join([str(MARKS)] + [str(mark) for mark in range(1, MARKS + 1)])
        text = samples.hd_text({'WaterLevelMarkList': [f'"{name}", {chainage}, {levels}' for name, chainage in PLACES]},
                               {'WaterLevelMarkTitles': [f'MarkTitles = {MARKS}, ' + ', '.join(f'"{t}"' for t in TITLES),
                                                         f'MarkInterpolate = {MARKS}' + ', true' * MARKS]})
        editor = self.open(text, **more)
        editor.go_to('User Def. Marks')
        self.at_left = [self.place(1, column) for column in (1, 2)]
        return editor

    def place(self, line, column):
        return self.editor.table().cell(line, column).place

    def level(self, line, mark):
        return self.saved().records('WaterLevelMarkList')[line - 1].split(', ')[2 + mark]

    def scroll_right(self):
        """With the keys, to the last column."""
        self.editor.click_cell(2, 3)
        self.editor.press('End')
        self.editor.settle()
        self.assertEqual([self.place(1, column) for column in (1, 2)], self.at_left)

    def test_typing_in_both_parts(self):
        editor = self.open_marks()
        self.scroll_right()
        editor.type('7.5\t')  # past the last cell: the first one of the next line
        editor.type('weser\t')
        editor.type('125\n')
        wait_for(lambda: editor.table().line(3)[:2] == ['WESER', '125'], 'branch and chainage are typed', 3)
        edge = self.place(1, 2)[0] + self.place(1, 2)[2]
        self.assertGreaterEqual(self.place(3, 3)[0], edge, 'the cell of the first mark comes from below the others')
        editor.type('2.5')
        editor.press('Return')
        self.scroll_right()
        editor.put(4, 1, 'main')  # by the mouse, in the frozen part
        editor.save()
        self.assertEqual(self.level(2, MARKS), '7.5')
        self.assertEqual(self.saved().records('WaterLevelMarkList')[2], '"WESER", 125, 40, 2.5, 2')
        self.assertEqual(self.saved().records('WaterLevelMarkList')[3], '"MAIN", 50, 40, 1, 2')

    def test_selecting_across_the_edge(self):
        editor = self.open_marks()
        self.scroll_right()
        editor.hands.drag(editor.table().cell(2, 2).middle, editor.table().cell(3, MARKS + 2).middle)
        wait_for(lambda: f'{2 * (MARKS + 1)} cells selected' in editor.status(), 'the columns between are selected', 3)
        editor.click_cell(1, MARKS + 1)
        editor.click_cell(4, 1, held='shift')
        wait_for(lambda: f'{4 * (MARKS + 1)} cells selected' in editor.status(), 'by clicks, too', 3)
        editor.click_cell(2, 2, button=3)  # the menu of the cell
        editor.press('Escape')

    def test_headers_and_filter_fields(self):
        editor = self.open_marks()
        self.scroll_right()
        x, y, width, height = editor.table().cell(1, 1).place
        head = y - height // 2
        editor.hands.drag((x + width, head), (x + width + 40, head))
        wait_for(lambda: self.place(1, 1)[2] == width + 40, 'the border follows the mouse', 3)
        self.assertEqual(self.place(1, 2)[0], self.at_left[1][0] + 40)
        editor.hands.click(self.place(1, 2)[0] + 20, head, times=2)
        wait_for(lambda: editor.table().cell(1, 1).name == 'ELBE', 'a double click sorts', 3)
        editor.press('ctrl+shift+f')
        editor.settle()
        editor.hands.click(x + 20, self.place(1, 1)[1] - height // 2)  # the field above the first column
        editor.type('rhi')
        wait_for(lambda: editor.table().lines == 2, 'filtered', 3)
        self.assertLess(self.place(1, 3)[0], x, 'still scrolled')
        editor.press('Down', 'Home')
        editor.type('inn\t')
        editor.save()
        self.assertEqual([line.split(',')[0] for line in self.saved().records('WaterLevelMarkList')],
                         ['"RHINE"', '"ELBE"', '"INN"', '"ELBE"'])
