#!/usr/bin/env python3
"""Scaling to paper and small pictures beside the peers, as whole processes over the same generated photographs.

usage: compare.py BUILD_FOLDER [--rounds N] [--pictures N] [--install]

Each peer is run in pairs with ours, in turn first and second, so that whatever else the machine does falls on both; the ratio of
a pair is peer's time / ours, and the median of the pairs is printed. Times are processor time; for more than one thread they are
elapsed time. --install fetches the peers from Debian first (root or sudo).
"""
import argparse, os, shutil, subprocess, sys, tempfile

sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), ".."))
from pairs import HEADING, compare, run


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build")
    parser.add_argument("--rounds", type=int, default=9)
    parser.add_argument("--pictures", type=int, default=12)
    parser.add_argument("--install", action="store_true")
    options = parser.parse_args()
    if options.install:
        subprocess.run([os.path.join(sys.path[0], "../packaging/install-packages"), "peers"], check=True)
        sys.exit("installed; build the preset bench again, then run without --install")

    programs = os.path.join(options.build, "bench", "peers")
    memory = "/dev/shm" if os.path.isdir("/dev/shm") else None
    with tempfile.TemporaryDirectory(dir=memory) as folder:
        source, out = os.path.join(folder, "source"), os.path.join(folder, "out")
        os.mkdir(source)
        os.mkdir(out)
        subprocess.run([os.path.join(programs, "bench_photographs"), source, str(options.pictures)], check=True)
        files = sorted(os.path.join(source, name) for name in os.listdir(source))
        bits = sum(os.path.getsize(name) for name in files) * 8 / (12e6 * len(files))
        print(f"{len(files)} photographs of 12 megapixels, {bits:.2f} bits a pixel; {options.rounds} interleaved pairs\n")

        def ours(mode, variant="best"):
            return [os.path.join(programs, "bench_ours"), mode, variant, out] + files

        def own(name):
            path = os.path.join(programs, name)
            return [path, "1800", "1200", out] + files if os.path.exists(path) else None

        vips = shutil.which("vipsthumbnail")
        magick = next((path for path in map(shutil.which, ("convert-im6.q16", "magick")) if path), None)
        paper_box = "1800x1350"
        vips_paper = [vips, "--size", paper_box, "--no-rotate", "-o", out + "/%s.jpg[Q=90,subsample-mode=on]"] + files if vips else None
        vips_small = [vips, "--size", "115x115", "--no-rotate", "-o", out + "/%s.jpg[Q=75,subsample-mode=on]"] + files if vips else None
        qt_small = [os.path.join(programs, "peer_qt"), "small", "115", out] + files
        magick_paper = [magick] + files + ["-resize", paper_box, "-sampling-factor", "4:2:0", "-quality", "90",
                                           out + "/%02d.jpg"] if magick else None
        one, two = {"VIPS_CONCURRENCY": "1"}, {"VIPS_CONCURRENCY": "2"}
        lines = [
            ("paper: vipsthumbnail, 1 thread", vips_paper, one, ours("paper"), ">= 2.5"),
            ("paper: Qt smooth scaling", own("peer_qt"), None, ours("paper"), ">= 1.6"),
            ("paper: OpenCV AREA", own("peer_opencv"), None, ours("paper"), ">= 2.3"),
            ("paper: ImageMagick, 1 thread", magick_paper, {"MAGICK_THREAD_LIMIT": "1"}, ours("paper"), ">= 7"),
            ("paper: zimg on the same planes", own("peer_zimg"), None, ours("paper"), ">= 0.95"),
            ("small pictures: vipsthumbnail, 1 thread", vips_small, one, ours("small", "1"), ""),
            ("small pictures: vipsthumbnail / ours on 2 threads, elapsed", vips_small, one, ours("small", "2"), ">= 2.2"),
            ("small pictures: Qt's reader, 1 thread", qt_small, None, ours("small", "1"), ""),
            ("drafts: vipsthumbnail, 1 thread", vips_small, one, ours("drafts"), ""),
            ("drafts: Qt's reader", qt_small, None, ours("drafts"), ""),
        ]
        print(HEADING)
        for line in lines:
            compare(*line, options.rounds)
        # The other way round: ours above, the floor below.
        run(ours("planes", "-"))
        floor = ours("floor", "-")
        compare("paper: ours / floor", ours("paper"), None, floor, "<= 1.20", options.rounds)
        compare("paper: ours with SSSE3 / floor", ours("paper", "SSSE3"), None, floor, "<= 1.30", options.rounds)
        compare("paper: ours in plain C++ / floor", ours("paper", "plain"), None, floor, "", options.rounds)
        kib = lambda command: int(subprocess.run(command, check=True, capture_output=True, text=True).stdout.split()[0])
        idle = kib([os.path.join(programs, "bench_ours"), "idle", "-", "-"])
        peak = kib(ours("paper"))
        print(f"\npaper: peak memory {peak / 1024:.1f} MiB, {(peak - idle) / 1024:.1f} MiB over idle (goal 24)")


main()
