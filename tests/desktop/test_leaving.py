"""Leaving a field, a cell, a page, a window: what was typed is stored, or refused once and in view."""
import samples
from case import Case
from waiting import wait_for

SIX_LINES = samples.hd_text({'InitList': [f'"MOORBECK", {100 * n}, {n}.25, {n}.5' for n in range(1, 7)],
                             'WindList': [f'"MOORBECK", {100 * n}, 0.{n}' for n in range(1, 7)],
                             'BedList': ['"MOORBECK", 100, 31', '"MOORBECK", 200, 32'],
                             'QSSContractionExpansionList': ['"MOORBECK", 100, 0.11, 0.31']},
                            {'Quasi_steady': ['EnergyEquation = true, 0', 'G_ContractExpansion = 0.15, 0.35']})


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
