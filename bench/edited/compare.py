#!/usr/bin/env python3
"""The edited print beside the peers, as whole processes over the same generated photographs, and the ticks of the preview.

usage: compare.py BUILD_FOLDER [--rounds N] [--pictures N]

The peers are those of bench/peers/compare.py --install. Each is run in interleaved pairs with ours; a ratio is peer's time / ours in
processor time, one thread each. "covered" turns by 7 degrees at zoom 130, so that the picture covers the paper; "not covered" at
zoom 100, so that the stretched picture shows at the corners.
"""
import argparse, os, shutil, subprocess, sys, tempfile

sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), ".."))
from pairs import HEADING, compare


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build")
    parser.add_argument("--rounds", type=int, default=7)
    parser.add_argument("--pictures", type=int, default=12)
    options = parser.parse_args()
    programs = os.path.join(options.build, "bench", "edited")
    magick = next((path for path in map(shutil.which, ("convert-im6.q16", "magick")) if path), None)
    memory = "/dev/shm" if os.path.isdir("/dev/shm") else None
    with tempfile.TemporaryDirectory(dir=memory) as folder:
        source, out, frames = (os.path.join(folder, name) for name in ("source", "out", "frames"))
        for name in (source, out, frames):
            os.mkdir(name)
        subprocess.run([os.path.join(options.build, "bench", "peers", "bench_photographs"), source, str(options.pictures)],
                       check=True)
        subprocess.run([os.path.join(programs, "edited_frame"), frames], check=True)
        files = sorted(os.path.join(source, name) for name in os.listdir(source))

        def own(name, zoom, mode):
            path = os.path.join(programs, "edited_" + name)
            return [path, zoom, mode, out, frames] + files if os.path.exists(path) else None

        def with_magick(zoom):
            width, height = 15 * int(zoom), round(1125 * int(zoom) / 100)
            return ["sh", "-c", 'magick=$1 out=$2 frame=$3 zoom=$4 size=$5 anchor=$6; shift 6; n=0; for file; do n=$((n+1)); '
                 'if [ "$zoom" = 130 ]; then back=""; else back="( -clone 0 -resize 1500x1000! -write mpr:back +delete )"; fi; '
                 '"$magick" "$file" -resize "$size!" $back '
                 '-color-matrix "1.06 0.001 0.001 0.001 1 0.001 0.001 0.001 0.94" -background none -virtual-pixel background '
                 '-define distort:viewport=1500x1000+0+0 -distort SRT "$anchor 1 7 750,500" '
                 '$([ "$zoom" = 130 ] || echo "mpr:back +swap -composite") '
                 '"(" "$frame" -resize 1500x1000! ")" -composite -font DejaVu-Sans -pointsize 80 '
                 '-fill "rgba(40,40,40,0.7)" -annotate +107+840 "Lumora 2024" -fill yellow -annotate +100+833 "Lumora 2024" '
                 '-sampling-factor 4:2:0 -quality 90 "$out/$n.jpg" || exit 1; done',
                 "sh", magick, out, os.path.join(frames, "bench", "f.png"), zoom, f"{width}x{height}",
                 f"{width // 2},{height // 2}"] + files if magick else None

        print(f"{len(files)} photographs of 12 megapixels to 1500x1000; {options.rounds} interleaved pairs\n\n{HEADING}")
        for zoom, name, most in (("130", "covered", "<= 1.85"), ("100", "not covered", "<= 2.0")):
            ours = own("ours", zoom, "jpeg")
            subprocess.run(own("ours", zoom, "planes"), check=True, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
            compare(f"{name}: Qt, prescaled", own("qt", zoom, "jpeg"), None, ours, ">= 1.3", options.rounds)
            compare(f"{name}: OpenCV", own("opencv", zoom, "jpeg"), None, ours, ">= 2.5", options.rounds)
            compare(f"{name}: libvips", own("vips", zoom, "jpeg"), {"VIPS_CONCURRENCY": "1"}, ours, ">= 4.5", options.rounds)
            compare(f"{name}: ImageMagick", with_magick(zoom), {"MAGICK_THREAD_LIMIT": "1"}, ours, ">= 12",
                    min(3, options.rounds))
            compare(f"{name}: ours / floor", ours, None, own("ours", zoom, "floor"), most, options.rounds)

        some = files[:6]
        print(f"\nluma in dB before JPEG against double precision, {len(some)} pictures, covered")
        for name in ("ours", "qt", "opencv", "vips"):
            command = own(name, "130", "pixels")
            if command:
                command = command[:5] + some
                subprocess.run(command, check=True, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
                command[0] = os.path.join(programs, "edited_quality")
                print(f"{name:10}", *subprocess.run(command, check=True, capture_output=True, text=True).stdout.split(),
                      flush=True)
        for scale in ("1", "2"):
            print(f"\npreview at {scale} times 450 x 300", flush=True)
            subprocess.run([os.path.join(programs, "edited_ticks"), frames, files[0], scale], check=True,
                           stderr=subprocess.DEVNULL)


main()
