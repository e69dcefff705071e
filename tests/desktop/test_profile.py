"""The long profile: what is dragged, added and removed in it, under the mouse and real keys, beside the tables."""
import os

import case
import samples
from case import Case
from waiting import wait_for

LINES = ['"MAIN", 1000, 14, 40', '"SIDE", 500, 30, 5', '"MAIN", 3000, 12, 60', '"MAIN", 2000, 13, 50']
MARK = (0xc8, 0x10, 0x3c)  # the color of the current place


class LongProfile(Case):
    def show(self):
        editor = self.open(samples.hd_text({'InitList': LINES}, {'Global_Values': ['G_waterlevel = 15', 'G_discharge = 45']}))
        editor.click_cell(4, 3)
        editor.press('F9')
        self.plot = wait_for(lambda: next((w for w in editor.frame.all('filler') if w.name == 'Long profile' and w.shown), None),
                             'the plot is shown', 5)
        editor.settle()
        return editor

    def marked(self):
        """The middles of the rings about the points of the current line, from top to bottom."""
        left, top, width, height = self.plot.place
        screen = case.session.pixels(left, top, width, height)
        rows = []
        for y in range(height):
            line = screen[4 * y * width:4 * (y + 1) * width]
            found = [x for x in range(width) if (line[4 * x + 2], line[4 * x + 1], line[4 * x]) == MARK]
            if found and found[-1] - found[0] >= 7:
                rows.append((y, (found[0] + found[-1]) // 2))
        rings = []
        for y, x in rows:
            if not rings or y - rings[-1][-1][0] > 4:
                rings.append([])
            rings[-1].append((y, x))
        return [(left + ring[len(ring) // 2][1], top + (ring[0][0] + ring[-1][0]) // 2) for ring in rings]

    def level(self, line):
        return float(self.editor.table().cell(line, 3).text)

    def test_points_are_moved_added_and_removed(self):
        editor = self.show()
        wait_for(lambda: len(self.marked()) == 2, 'level and discharge of the line are marked', 5)
        x, y = self.marked()[0]
        editor.hands.drag((x, y), (x, y - 12))
        wait_for(lambda: self.level(4) > 13, 'the point is higher', 3)
        self.assertIn('Dragging of a point', editor.status())
        editor.press('ctrl+z')
        wait_for(lambda: self.level(4) == 13 and not editor.modified, 'one step takes it back', 3)
        x, y = self.marked()[0]
        with editor.hands.holding('ctrl'):
            editor.hands.drag((x, y), (x + 60, y + 20))
        wait_for(lambda: float(editor.table().cell(4, 2).text) > 2000, 'with Ctrl the line moves along the branch', 3)
        self.assertEqual(self.level(4), 13)
        editor.press('ctrl+z')

        x, y = self.marked()[1]
        editor.hands.click(x + 70, y + 5, times=2)
        wait_for(lambda: 'Line inserted' in editor.status(), 'a double click adds a line', 3)
        line = editor.table().line(5)
        self.assertEqual(line[0], 'MAIN')
        self.assertLess(float(line[2]), 13, 'its level lies on the line that was there')
        self.assertGreater(float(line[2]), 12)
        editor.press('Delete')
        wait_for(lambda: 'Line deleted' in editor.status(), 'the current point is removed', 3)
        editor.press('ctrl+z', 'ctrl+z')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES, 'nothing is left of all that')

    def test_it_follows_the_tables_and_leads_to_them(self):
        editor = self.show()
        editor.hands.click(*self.marked()[0])  # the plot has the keyboard now
        editor.press('Right')
        wait_for(lambda: editor.status().startswith('Line 3 of 4'), 'the next point of the branch is the line of the file', 3)
        editor.press('Left', 'Left')
        wait_for(lambda: editor.status().startswith('Line 1 of 4'), 'and the previous ones', 3)
        editor.click_cell(2, 2)
        wait_for(lambda: self.plot.description.startswith('SIDE'), 'another branch is shown with its line', 3)
        editor.put(2, 3, '31', leave='Return')
        wait_for(lambda: '31 m' in self.plot.description, 'what is typed is drawn', 3)
        editor.put(1, 3, '9.5', leave=None)
        editor.hands.click(*self.plot.middle)
        wait_for(lambda: self.level(1) == 9.5, 'a click beside the table takes what was typed', 3)
        editor.go_to('Wave Approx')
        editor.press('F9')
        wait_for(lambda: not self.plot.shown, 'the same key hides it', 3)
        self.assert_no_message()


class WithoutPlots(Case):
    """The program goes without the library that draws."""

    def test_it_says_what_is_missing(self):
        program = os.environ['KVR_BIN']
        bare = f'{self.folder}/bare'
        os.makedirs(bare)
        for entry in os.listdir(program):
            if not entry.startswith('KVR_PLOT'):
                os.symlink(os.path.join(os.path.abspath(program), entry), f'{bare}/{entry}')
        # A program finds its libraries beside itself, wherever a link leads.
        os.remove(f'{bare}/kvrshell')
        os.link(os.path.join(program, 'kvrshell'), f'{bare}/kvrshell')
        os.environ['KVR_BIN'] = bare
        try:
            editor = self.open(samples.hd_text({'InitList': LINES}))
        finally:
            os.environ['KVR_BIN'] = program
        editor.press('F9')
        wait_for(lambda: any('KVR_PLOT' in label.text for label in editor.frame.all('label') if label.shown),
                 'what is missing is named', 5)
        editor.put(1, 3, '7.5')
        editor.save()
        self.assertEqual(self.saved().records('InitList')[0], '"MAIN", 1000, 7.5, 40')
