"""What a field or a cell takes, and the keys of tables."""
import subprocess

import samples
from case import Case
from screen import State
from waiting import wait_for

CURVES = ['"MOORBECK", 100, 1, 2, 3, 4', '"MOORBECK", 200, 1, 2, 3, 4', '"MOORBECK", 300, 1, 2, 3, 4']


def clipboard():
    return subprocess.run(['xclip', '-selection', 'clipboard', '-o'], capture_output=True, text=True,
                          timeout=10).stdout


class Numbers(Case):
    def test_passed_through(self):
        """What nobody types keeps its last bit."""
        editor = self.open()
        editor.go_to('Default Values')
        editor.click(editor.field('Struc Fac'))
        editor.press('Tab', 'shift+Tab', 'Tab')
        editor.fill('Delta', '0.75')
        editor.save()
        self.assertEqual(self.saved().value('struc_fac'), '0.26')


class TableKeys(Case):
    def test_copy_after_undo(self):
        editor = self.open()
        editor.put(1, 3, '9.5', leave='Return')
        editor.hands.drag(editor.table().cell(2, 1).middle, editor.table().cell(3, 4).middle)
        editor.press('ctrl+z')
        editor.settle()
        cells = [editor.table().cell(line, column) for line in range(1, 4) for column in range(1, 5)]
        current = [cell.name for cell in cells if cell.has(State.FOCUSED)]
        editor.press('ctrl+c')
        editor.settle()
        self.assertEqual([clipboard().strip()], current)

    def test_held_shift_keeps_one_section_selected(self):
        """Another window's current section is one section, whatever key is held here."""
        editor = self.open_project(samples.hd_text({'InitList': [f'"MOORBECK", {n}, 1, 2' for n in (0, 1000, 2000)]}))
        editor.click_cell(3, 1)
        editor.settle(0.2)
        with editor.hands.holding('shift'):
            editor.press('Tab')
            editor.settle(0.3)
            sections = editor.table('Cross sections by branch and chainage')
            selected = [line for line in range(1, 4) if sections.cell(line, 1).selected]
        self.assertEqual(selected, [2])
