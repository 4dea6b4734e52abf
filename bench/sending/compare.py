#!/usr/bin/env python3
"""An order by FTP beside lftp's mirror, over a line of 40 ms a round trip that carries 1 MB/s a connection, to vsftpd.

usage: compare.py BUILD_FOLDER [--rounds N] [--pictures N] [--folders N] [--ways WORDS]

Ours is the program itself, without a screen, with [Guards] Careful; the time runs at the relay from the first connect to the end of the
last control line, which closes with the verdict: no countdown, no reports. lftp mirrors the same files. Each round plays all in changing
order; the ratio is ours / lftp's of the same round. Commands and listings are counted in the server's log. The second table has so many
folders of other orders (--folders) beside the order's.
"""
import argparse, collections, getpass, os, pathlib, re, shutil, socket, statistics, subprocess, sys, tempfile, time

here = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(here))
sys.dont_write_bytecode = True
from relay import Relay  # noqa: E402

NEAR, FAR = "127.0.0.2", "127.0.0.1"
DELAY, RATE = 0.02, 1_000_000
MEGAPIXELS = 1.1    # prints of about 300 KB
ONE, THREE = "lftp mirror -R", "lftp mirror -R --parallel=3"
OURS = collections.OrderedDict((
    ("each", ("Session = each", None, None)), ("kept", ("Session = kept", ONE, 1.15)),
    ("Lines = 3", ("Session = kept\nLines = 3", THREE, 1.15))))

VSFTPD = """listen=YES
listen_address={address}
listen_port={port}
background=NO
run_as_launching_user=YES
ftp_username={user}
anonymous_enable=YES
no_anon_password=YES
local_enable=NO
write_enable=YES
anon_upload_enable=YES
anon_mkdir_write_enable=YES
anon_other_write_enable=YES
anon_world_readable_only=NO
anon_umask=022
anon_root={folder}/account
secure_chroot_dir={folder}/empty
pasv_min_port={first}
pasv_max_port={last}
pasv_address={near}
seccomp_sandbox=NO
xferlog_enable=YES
vsftpd_log_file={folder}/log
log_ftp_protocol=YES
"""


def free_ports(count):
    """So many numbers in a row that both addresses have free."""
    for first in range(21000, 60000, count):
        taken = []
        try:
            for port in range(first, first + count):
                for address in (NEAR, FAR):
                    taken.append(socket.create_server((address, port)))
            return range(first, first + count)
        except OSError:
            pass
        finally:
            for listener in taken:
                listener.close()
    sys.exit("no ports are free")


class Server:
    def __init__(self, folder):
        self.folder, self.base = folder, folder / "account" / "zalamim234"
        (folder / "empty").mkdir(parents=True)
        self.base.mkdir(parents=True)
        ports = free_ports(64)
        self.port = ports[0]
        configuration = folder / "vsftpd.conf"
        configuration.write_text(VSFTPD.format(address=FAR, near=NEAR, port=self.port, first=ports[1], last=ports[-1],
                                               user=getpass.getuser(), folder=folder))
        self.process = subprocess.Popen(["/usr/sbin/vsftpd", configuration], stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)
        for _ in range(200):
            try:
                socket.create_connection((FAR, self.port)).close()
                break
            except OSError:
                if self.process.poll() is not None:
                    sys.exit("vsftpd does not start")
                time.sleep(0.02)
        self.relay = Relay(NEAR, FAR, self.port, ports[1:], DELAY, RATE)

    def stop(self):
        self.process.terminate()
        self.process.wait()
        self.relay.stop()

    def clear(self, strangers):
        shutil.rmtree(self.base)
        self.base.mkdir()
        for number in range(strangers):
            (self.base / f"2026_10_{1 + number % 28:02}_KUP_5678^{number + 1000}").mkdir()
        (self.folder / "log").write_text("")

    def commands(self):
        return collections.Counter(re.findall(r'FTP command: Client "[^"]*", "(\w+)', (self.folder / "log").read_text(errors="replace")))


class Order:
    """Made once by the program; each sending begins with a copy of its data folder."""

    def __init__(self, build, folder, pictures):
        self.drive, self.folder, self.made = build / "tools/drive/lumora-drive", folder, folder / "made"
        self.runtime = folder / "runtime"
        for each in (self.made, self.runtime):
            each.mkdir(parents=True, mode=0o700)
        subprocess.run([build / "demo/pictures/lumora-demo-pictures", self.made / "shown", str(pictures), str(MEGAPIXELS)],
                       check=True, stdout=subprocess.DEVNULL)
        self.play("make", self.made, "127.0.0.1:9", "")

    def play(self, scenario, data, host, keys):
        lab = self.folder / "lab.ini"
        lab.write_text((here / "lab.ini.in").read_text().format(host=host, keys=keys, data=data))
        lab.chmod(0o600)
        with open(self.folder / "out", "wb") as out:
            status = subprocess.run([self.drive, "--lab", lab, here / (scenario + ".scenario")], cwd=data, stdout=out, stderr=out,
                                    env={**os.environ, "XDG_RUNTIME_DIR": str(self.runtime), "QT_QPA_PLATFORM": "offscreen"}).returncode
        if status:
            sys.exit((self.folder / "out").read_text(errors="replace"))

    def copy(self):
        """Data folder and the files that travel, by name."""
        data = self.folder / "data"
        shutil.rmtree(data, ignore_errors=True)
        shutil.copytree(self.made, data)
        return data

    @staticmethod
    def files(data):
        order = next(path for path in data.glob("2000lumora/!!000/*") if path.is_dir())
        small = data / "2000lumora/000.jpg"
        return order.name, [path for path in order.iterdir() if path.name[0] != "."] + [small] * small.is_file()


def send(way, server, order):
    """Seconds, or none where it can't be played."""
    data = order.copy()
    if way in OURS:
        order.play("send", data, f"{NEAR}:{server.port}", OURS[way][0])
        name, files = order.files(data)
    else:
        name, files = order.files(data)
        mirrored = order.folder / "mirrored" / name
        shutil.rmtree(mirrored.parent, ignore_errors=True)
        mirrored.mkdir(parents=True)
        for path in files:
            shutil.copy2(path, mirrored)
        command = way.replace("lftp ", "") + f' "{mirrored}" "zalamim234/{name}"'
        subprocess.run(["lftp", "--norc", "-c", f"set ftp:ssl-allow no; open -u ftp,loopback-lab {NEAR}:{server.port}; {command}"],
                       check=True, stdout=subprocess.DEVNULL)
    time.sleep(0.2)    # the last line closes
    for path in files:
        if (server.base / name / path.name).read_bytes() != path.read_bytes():
            sys.exit(f"{way}: {path.name} has not arrived whole")
    return server.relay.last - server.relay.first


def table(title, ways, rounds, strangers, server, order):
    taken, seen = {way: [] for way in ways}, {}
    for turn in range(rounds):
        for way in ways if turn % 2 == 0 else reversed(ways):
            server.clear(strangers)
            server.relay.begin()
            taken[way].append(send(way, server, order))
            commands = server.commands()
            seen[way] = (sum(commands.values()), commands["LIST"] + commands["NLST"] + commands["MLSD"], server.relay.most)
    print(f"\n{title}\n{'':30} {'seconds':>8} {'lowest':>8} {'highest':>8} {'commands':>9} {'listings':>9} {'lines':>6}  ours / lftp (goal)")
    for way, times in taken.items():
        ratio = ""
        peer = OURS.get(way, (None,) * 3)[1]
        if peer in taken:
            ratios = [ours / theirs for ours, theirs in zip(times, taken[peer])]
            ratio = f"  {statistics.median(ratios):.2f}, {min(ratios):.2f} to {max(ratios):.2f} (<= {OURS[way][2]})"
        print(f"{way:30} {statistics.median(times):8.2f} {min(times):8.2f} {max(times):8.2f} "
              f"{seen[way][0]:9} {seen[way][1]:9} {seen[way][2]:6}{ratio}", flush=True)
    return {way: statistics.median(times) for way, times in taken.items()}


def main():
    parser = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    parser.add_argument("build", type=pathlib.Path)
    parser.add_argument("--rounds", type=int, default=3)
    parser.add_argument("--pictures", type=int, default=100)
    parser.add_argument("--folders", type=int, default=5000)
    parser.add_argument("--ways", help="some of: " + ", ".join((*OURS, ONE, THREE)))
    options = parser.parse_args()
    ways = options.ways.split(",") if options.ways else [*OURS, ONE, THREE]
    if not shutil.which("lftp"):
        print("lftp: not installed")
        ways = [way for way in ways if way in OURS]
    with tempfile.TemporaryDirectory() as scratch:
        folder = pathlib.Path(scratch)
        order = Order(options.build.resolve(), folder / "order", options.pictures)
        server = Server(folder / "server")
        try:
            files = order.files(order.made)[1]
            print(f"{len(files)} files, {sum(path.stat().st_size for path in files) / 1e6:.1f} MB; {options.rounds} rounds; "
                  f"{2000 * DELAY:.0f} ms a round trip, {RATE / 1e6:.0f} MB/s a connection; load {os.getloadavg()[0]:.1f}")
            plain = table("No other order there", ways, options.rounds, 0, server, order)
            beside = [way for way in ways if way != "each"]
            crowded = table(f"{options.folders} folders of other orders", beside, options.rounds, options.folders, server, order)
            listing = sum(len(f"drwxr-xr-x    2 ftp      ftp          4096 Nov 22 01:02 {path.name}\r\n") for path in server.base.iterdir()) / RATE
            for way in beside:
                if way in OURS:
                    print(f"{way}: {crowded[way] - plain[way]:+.2f} s; a listing of these folders takes {listing + 4 * DELAY:.2f} s")
        finally:
            server.stop()


if __name__ == "__main__":
    main()
