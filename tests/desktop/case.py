"""The base of the cases: an editor on fresh files, and what is kept when a case fails."""
import functools
import os
import shutil
import subprocess
import unittest

import samples
from editor import Editor
from waiting import wait_for

session = None  # the desktop that run.py starts


class Case(unittest.TestCase):
    """Each case has a folder of its own below the build folder; pictures and logs of failed cases stay in it."""

    def __init_subclass__(cls):
        super().__init_subclass__()
        for name, method in list(vars(cls).items()):
            if name.startswith('test_'):
                setattr(cls, name, keeping_evidence(method))

    def setUp(self):
        self.folder = os.path.join(os.environ['KVR_OUT'], self.id())
        shutil.rmtree(self.folder, ignore_errors=True)
        os.makedirs(self.folder)
        self.editor = None

    def tearDown(self):
        self.end()

    def end(self):
        """Ends the editor and looks at how it fared."""
        if not self.editor:
            return
        ended = self.editor.process.poll()
        log = self.editor.end()
        self.editor = None
        self.assertIsNone(ended, f'the program ended by itself with {ended}:\n{log}')
        # What the program itself finds wrong with its keys, and what sanitizers find.
        for complaint in ('Ambiguous shortcut', 'runtime error:', 'ERROR: AddressSanitizer'):
            self.assertNotIn(complaint, log)

    def open(self, text=None, language=None, name='moor.HDKV'):
        """Starts the editor on one HD file with this text."""
        samples.write(f'{self.folder}/{name}', text or samples.hd_text())
        return self.start(name, language=language)

    def open_project(self, text=None, branches=None, language=None):
        samples.write_project(self.folder, text, branches)
        editor = self.start('moor.kvrp', language=language)
        wait_for(lambda: len(editor.windows()) >= 3, 'the project opens its three files')
        editor.settle()
        return editor

    def start(self, *files, language=None, recovers=False):
        self.end()
        self.editor = Editor(self.folder, *files, language=language, recovers=recovers)
        return self.editor

    def saved(self, name='moor.HDKV'):
        return samples.Saved(samples.same_name(self.folder, name))

    def assert_clean(self, name='moor.HDKV'):
        """The project's own tool finds nothing in the saved file."""
        self.assertEqual(samples.misread(samples.same_name(self.folder, name)), [])

    def assert_no_message(self):
        self.assertIsNone(self.editor.no_message(), 'a message nobody asked for')

    def assert_told_once(self, *words, button='OK'):
        """Exactly one message is up; it holds the words and is answered. Gives back its texts."""
        texts = self.editor.answer(button)
        for word in words:
            self.assertIn(word, '\n'.join(texts))
        self.assert_no_message()
        return texts


def keeping_evidence(method):
    @functools.wraps(method)
    def run(self):
        try:
            method(self)
        except unittest.SkipTest:
            raise
        except BaseException as error:
            picture = f'{self.folder}/failed.png'
            session.picture(picture)
            keys = '\n    '.join(self.editor.hands.log) if self.editor else ''
            error.add_note(f'screen: {picture}\nkeys:\n    {keys}') if hasattr(error, 'add_note') else None
            raise

    return run
