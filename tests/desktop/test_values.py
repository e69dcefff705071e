"""Values shown as they are."""
import case
import samples
from case import Case
from waiting import wait_for


class HiddenDigits(Case):
    TEXT = samples.hd_text({'InitList': ['"MOORBECK", 1500.6, 1.23456, 10.5'],
                            'BedList': ['"MOORBECK", 100, 0.0325']})

    def test_status_bar_gives_the_full_value(self):
        editor = self.open(self.TEXT)
        editor.click_cell(1, 2)
        wait_for(lambda: '1500.6' in editor.status(), f'the status bar gives 1500.6, not {editor.status()}', 3)

    def test_status_bar_gives_the_full_value_of_a_field(self):
        editor = self.open(self.TEXT)
        editor.fill('Water Level', '1.23456789', leave=None)
        editor.press('Tab', 'shift+Tab')
        wait_for(lambda: 'Water Level: 1.23456789 m' in editor.status(), f'the field, not {editor.status()}', 3)
        editor.press('Tab')
        wait_for(lambda: 'Water Level' not in editor.status(), 'it goes with the focus', 3)

    def test_a_long_number_is_shown_whole(self):
        editor = self.open(self.TEXT)
        cell = editor.table().cell(1, 4)
        before = cell.place[2]
        editor.put(1, 4, '12345678901.125')
        self.assertGreater(cell.place[2], before)

    def test_all_digits(self):
        """What a cell hides is painted when the user wants to see it, and not when not."""
        editor = self.open(self.TEXT)

        def painted():
            editor.settle()
            return [case.session.pixels(*editor.table().cell(1, column).place) for column in (2, 3)]

        editor.click_cell(1, 1)
        before = painted()
        editor.menu('View', 'All Digits')
        self.assertNotEqual(painted()[0], before[0])
        self.assertNotEqual(painted()[1], before[1])
        editor.menu('View', 'All Digits')
        self.assertEqual(painted(), before)


class Levels(Case):
    def test_marks_have_the_unit_of_levels(self):
        editor = self.open(samples.hd_text({'WaterLevelMarkList': ['"MOORBECK", 100, 1, 10']},
                                           {'WaterLevelMarkTitles': ['MarkTitles = 1, "FLOOD"',
                                                                     'MarkInterpolate = 1, true']}))
        editor.go_to('User Def. Marks')
        self.assertEqual(editor.table('Local Values').line(1)[2], '10')
        editor.menu('View', 'Units', 'US Customary')
        wait_for(lambda: editor.table('Local Values').line(1)[2].startswith('32.8'), 'the level is shown in feet', 3)

    def test_first_line_follows_the_global_value(self):
        """The line that an empty list is shown with takes the values of the moment it is named."""
        editor = self.open(samples.hd_text({'InitList': []}))
        editor.fill('Water Level', '5')
        editor.put(1, 1, 'INN')
        editor.put(1, 2, '100')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), ['"INN", 100, 5, 12'])


class TypedUnits(Case):
    """An amount is converted where it is typed; another quantity is refused, and the box says what is possible."""
    TEXT = samples.hd_text({'InitList': ['"MOORBECK", 1500, 1, 10']})

    def test_amounts_and_formulas_in_cells_and_fields(self):
        editor = self.open(self.TEXT)
        editor.fill('Water Level', '12 ft')
        editor.put(1, 2, '1.2 km', speed=10)
        editor.put(1, 3, '=10+5', speed=10)
        editor.put(1, 4, '350 l/s', speed=10)
        editor.put(1, 4, '3 kg')
        box = editor.box_texts()
        self.assertIn('"kg" is no unit of this quantity', box[0])
        self.assertIn('cfs', box[0])
        editor.answer()
        editor.press('Escape')
        editor.menu('View', 'Units', 'US Customary')
        editor.fill('Water Level', '10')
        editor.put(1, 3, '2 m')
        editor.save()
        self.assertEqual(self.saved().records('InitList'), ['"MOORBECK", 1200, 2, 0.35'])
        self.assertEqual(self.saved().value('G_waterlevel'), '3.048')
