#!/usr/bin/python3
"""run.py [unittest arguments]: runs modules or single cases of this folder on a desktop of their own.

    KVR_BIN=build/dev/bin KVR_OUT=build/dev/desktop tests/desktop/run.py test_leaving.EmptiedCell -v
"""
import os
import sys
import unittest

from session import Session

if __name__ == '__main__':
    here = os.path.dirname(os.path.abspath(__file__))
    for variable, folder in (('KVR_BIN', 'build/dev/bin'), ('KVR_OUT', 'build/dev/desktop')):
        os.environ[variable] = os.path.abspath(os.environ.get(variable, os.path.join(here, '../..', folder)))
    with Session() as session:
        import case  # the accessibility bus is looked up as soon as it is imported

        case.session = session
        os.chdir(here)
        result = unittest.main(module=None, exit=False).result
    sys.exit(0 if result.wasSuccessful() and result.testsRun else 1)
