"""Interleaved pairs of whole programs, for the scripts beside."""
import os, statistics, subprocess, sys, time


def run(command, environment=None):
    """Elapsed seconds and processor seconds."""
    begin = time.monotonic()
    process = subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
                               env={**os.environ, **(environment or {})})
    _, status, usage = os.wait4(process.pid, 0)
    process.returncode = os.waitstatus_to_exitcode(status)
    if process.returncode != 0:
        sys.exit(f"failed with {process.returncode}: {' '.join(command[:6])} ...")
    return time.monotonic() - begin, usage.ru_utime + usage.ru_stime


def compare(label, peer, environment, mine, goal, rounds):
    """Prints the median of peer / mine over so many pairs, run in changing order."""
    elapsed = "elapsed" in label
    if not peer:
        print(f"{label:62} {goal:>8}   not installed")
        return
    ratios = []
    run(mine)
    for turn in range(rounds):
        if turn % 2:
            theirs, ourtime = run(peer, environment), run(mine)
        else:
            ourtime, theirs = run(mine), run(peer, environment)
        ratios.append(theirs[not elapsed] / ourtime[not elapsed])
    print(f"{label:62} {goal:>8} {statistics.median(ratios):7.2f} {min(ratios):7.2f} {max(ratios):7.2f}", flush=True)


HEADING = f"{'peer / ours':62} {'goal':>8} {'median':>7} {'lowest':>7} {'highest':>7}"
