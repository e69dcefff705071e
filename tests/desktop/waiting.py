"""Waiting for what the program does in its own time."""
import os
import time

# A build with sanitizers, or a busy machine, needs more of it.
PATIENCE = float(os.environ.get('KVR_PATIENCE', '1'))


class NotInTime(AssertionError):
    """What was waited for did not come."""


def wait_for(met, what, seconds=8.0):
    """Polls until `met()` gives something true, and gives that back."""
    end = time.monotonic() + seconds * PATIENCE
    while True:
        found = met()
        if found:
            return found
        if time.monotonic() > end:
            raise NotInTime(f'waited in vain: {what}')
        time.sleep(0.03)
