"""Runs that are mostly waiting, shared among several displays."""
import os
import subprocess
import sys
import tempfile

HERE = os.path.dirname(os.path.abspath(__file__))
sys.path.insert(0, f'{HERE}/../desktop')


def run_here(work, name, number, seed):
    """Calls `work(folder, number, seed)` on a display of its own. Why it ended early, or what it gave back."""
    from session import Session

    with Session() as desktop, tempfile.TemporaryDirectory() as folder:
        try:
            return work(folder, number, seed)
        except Exception as error:
            picture = f'{tempfile.gettempdir()}/{name}-failed-{seed}.png'
            desktop.picture(picture)
            return f'{type(error).__name__}: {error}; screen: {picture}'


def run_on(displays, script, number, seed):
    """Shares a number of runs of a script among displays, each in a process that has it in its environment."""
    shares = [number // displays + (each < number % displays) for each in range(displays)]
    runs = [subprocess.Popen([sys.executable, '-B', script, str(share), str(seed + each)])
            for each, share in enumerate(shares) if share]
    failed = sum(run.wait() != 0 for run in runs)
    return f'{failed} of {len(runs)} displays ended early' if failed else None


def main(work, script, usage):
    """The command line: how often, the first seed, and on how many displays."""
    if len(sys.argv) not in (2, 3, 4):
        sys.exit(usage)
    os.environ['KVR_BIN'] = os.path.abspath(os.environ.get('KVR_BIN', f'{HERE}/../../build/dev/bin'))
    number, seed, displays = (*map(int, sys.argv[1:]), *(1, 1)[len(sys.argv) - 2:])
    name = os.path.splitext(os.path.basename(script))[0]
    sys.exit(run_on(displays, script, number, seed) if displays > 1 else run_here(work, name, number, seed))
