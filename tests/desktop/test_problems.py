"""The list of problems: what leads to their places and mends them, with real keys, in a project with its network."""
import samples
from case import Case
from waiting import wait_for

LINES = ['"MOORBECK", 100, 1.25, 10.5', '"MOORBECK", 100, 1.25, 10.5', '"MOORBECK", 99999, 1.5, 11', '"NOWHERE", 5, 1, 1']
REACHES = ['"MOORBECK", 900, 400, 2']


class Problems(Case):
    def show(self, language=None):
        editor = self.open_project(samples.hd_text({'InitList': LINES, 'WaveList': REACHES, 'WindList': []},
                                                   {'Heat_Balance': ['Calc = true', 'Latitude = 999']}))
        editor.press('shift+F8')
        self.list = editor.table('Problems')
        self.expect('The network has no branch NOWHERE', '999', '99999', 'The reach ends', 'Line 1 is the same')
        return editor

    def texts(self):
        try:
            return [self.list.cell(row, 1).name for row in range(1, self.list.lines + 1)]
        except AttributeError:  # a line has gone meanwhile
            return []

    def expect(self, *beginnings):
        def is_so():
            texts = self.texts()
            return len(texts) == len(beginnings) and all(map(str.startswith, texts, beginnings))
        wait_for(is_so, f'the list says {beginnings}', 5)

    def test_they_lead_to_their_places_and_go_when_these_are_mended(self):
        editor = self.show()
        editor.press('F8', 'F8')
        wait_for(lambda: editor.current_page() == 'Heat Balance', 'the second problem is a field', 5)
        editor.type('48.5')
        editor.press('Tab')
        self.expect('The network', '99999', 'The reach ends', 'Line 1')
        editor.click(self.list.cell(2, 1))
        wait_for(lambda: editor.status().startswith('Line 3 of 4'), 'a click leads to the line', 5)
        editor.type('9000')
        editor.press('Return')
        self.expect('The network', 'The reach ends', 'Line 1')
        editor.press('ctrl+z')
        self.expect('The network', '99999', 'The reach ends', 'Line 1')
        self.assert_no_message()

    def test_what_is_beyond_doubt_is_mended_by_the_list(self):
        editor = self.show()
        editor.click(self.list.cell(5, 1))
        editor.click(editor.field('Remove the line', 'push button'))
        self.expect('The network', '999', '99999', 'The reach ends')
        editor.click(self.list.cell(4, 1))
        editor.click(editor.field('Exchange start and end', 'push button'))
        self.expect('The network', '999', '99999')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), LINES[1:])
        self.assertEqual(self.saved().records('WaveList'), ['"MOORBECK", 400, 900, 2'])
        editor.press('ctrl+z', 'ctrl+z')
        self.expect('The network', '999', '99999', 'The reach ends', 'Line 1')

    def test_what_is_being_typed_is_taken_before_a_problem_is_shown(self):
        editor = self.show()
        editor.go_to('Initial')
        editor.put(1, 3, '7.5', leave=None)
        editor.press('F8')
        self.expect('The network', '999', 'Line 1 is for the same', '99999', 'The reach ends')
        editor.put(1, 3, '7,5,', leave=None)
        editor.click(self.list.cell(2, 1))
        self.assert_told_once('number')
        self.assertEqual(editor.current_page(), 'Initial')

    def test_they_follow_the_network(self):
        editor = self.show()
        editor.put(2, 1, 'NOWHERE', leave='Return', table=editor.table('Branches'))
        self.expect('999', '99999', 'The reach ends', 'Line 1')
        editor.press('ctrl+z')
        self.expect('The network', '999', '99999', 'The reach ends', 'Line 1')
