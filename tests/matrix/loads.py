"""Large orders: the memory of the program that sends one, and how long two servers take for the same one."""
import statistics
import threading
import time

from cases import Case
from faults import Fault
from relay import Act

MEMORY = 100        # MB that the sending of 1,000 pictures may hold at most
# How much longer proftpd may take than vsftpd: as a factor where the session is kept, in seconds a file where each file has its own,
# since proftpd takes no connection for 0.2 s, twice, after each session that ends.
FACTOR = 1.25
SLOWER = 0.5
TIMED = 100         # files, log, sheet and small picture among them
ROUNDS = 3


class Load(Case):
    """An order is made by one program and sent by the next one, which goes on with it."""

    def __init__(self, tools, number, name, server, careful, pictures):
        super().__init__(tools, number, 'ftp', server, Fault(name, limit=900), careful)
        self.part, self.count = 'load', pictures

    def open(self):
        self.pictures = self.tools.shown(f'shown-{self.number}-{self.server}', self.count, '0.05')
        super().open()
        self.mine.begin('plain', 'prepared', lab=self.lab(), hurry=10)
        self.mine.end(self.fault.limit)
        if self.mine.status or not self.mine.is_whole_here(pictures=self.count):
            raise RuntimeError('the order was not made: ' + self.mine.last_words())

    def send(self, hurry, host=None):
        """True: all has arrived, and the lab was told once."""
        self.mine.begin('goon', 'ftp', lab=self.lab(host=host), hurry=hurry)
        highest = []
        threading.Thread(target=self.watch, args=(highest,), daemon=True).start()
        ended = self.mine.end(self.fault.limit)
        self.most = max(highest, default=0)
        there = self.arrived / self.mine.order().name
        whole = all((there / name).is_file() and (there / name).read_bytes() == content for name, content in self.mine.files().items())
        return ended and self.mine.told() == 'arrived' and whole and not self.wrong_reports(1)

    def watch(self, highest):
        """The most memory that the program ever held, in MB."""
        try:
            while True:
                with open(f'/proc/{self.mine.program.pid}/status') as status:
                    highest += [int(line.split()[1]) / 1000 for line in status if line.startswith('VmHWM')]
                time.sleep(0.1)
        except OSError:
            pass

    def play_case(self):
        good = self.send(hurry=10)
        self.result, self.found = f'{self.count} pictures sent with at most {self.most:.0f} MB of memory', []
        if not good or not 0 < self.most < MEMORY:
            self.found = ['not arrived whole' if not good else f'{MEMORY} MB are allowed']


class Timed(Load):
    """Seconds from the making of the folder on the server to the done call, without a relay between."""

    def __init__(self, tools, number, server, kept):
        super().__init__(tools, number, f'{TIMED} files', server, True, TIMED - 3)
        self.kept = kept

    def play_case(self):
        seen = {}
        self.web.acts['DONE'] = Act(lambda session: seen.setdefault('end', time.time()) and False)
        server = f'127.0.0.1:{self.ftp.port}'
        threading.Thread(target=self.wait_for_the_folder, args=(seen,), daemon=True).start()
        good = self.send(hurry=1, host=server)
        self.taken = seen['end'] - seen['begin'] if good and len(seen) == 2 else None
        self.result, self.found = (f'{self.taken:.1f} s', []) if self.taken else ('not arrived whole', ['not measured'])

    def wait_for_the_folder(self, seen):
        there = self.arrived / self.mine.order().name
        while 'end' not in seen and not there.is_dir():
            time.sleep(0.002)
        seen['begin'] = time.time()


def compare(tools, number, servers, kept, run):
    """Both servers in turn, several times; gives the text and whether the limit holds. run: plays a case and gives it."""
    taken = {server: [] for server in servers}
    for _ in range(ROUNDS):
        for server in servers:
            case = run(Timed(tools, number, server, kept))
            taken[server].append(getattr(case, 'taken', None))
    if None in sum(taken.values(), []):
        return f'{TIMED} files: not measured: {taken}', False
    first, second = (statistics.median(taken[server]) for server in servers)
    more = (second - first) / TIMED
    session = 'the session kept' if kept else 'a session for each file'
    return f'{TIMED} files on loopback, {session}, median of {ROUNDS}: {servers[0]} {first:.1f} s, {servers[1]} {second:.1f} s, ' \
        f'ratio {second / first:.2f}, {more:.2f} s more a file', second <= first * FACTOR if kept else more <= SLOWER
