"""One case: a whole order sent by lumora-drive before a server and a line with a fault, and what became of it."""
import os
import pathlib
import re
import shutil
import socket
import subprocess
import time

from faults import STRAY, Fault
from relay import Act, Relay
from servers import ACCOUNT, PASSWORD, RealFtp, ScriptedFtp, WebLab, listen

PICTURES = 3
HERE = 'the order on this machine'
NOT_KNOWN = 'arrived whole, whether the lab was told is not known'
FOLDER = pathlib.Path(__file__).resolve().parent
LAB = (FOLDER / 'lab.ini.in').read_text()


class Tools:
    """The programs under test and what all cases share."""

    def __init__(self, drive, quick_time, pictures, scratch, unpacked, type_is_known):
        self.drive, self.quick_time, self.scratch, self.unpacked = drive, quick_time, scratch, unpacked
        self.type_is_known = type_is_known    # the lab's file has a key for the type of the transfer
        self.pictures = scratch / 'shown'
        subprocess.run([pictures, self.pictures, str(PICTURES), '0.2'], check=True, stdout=subprocess.DEVNULL)
        self.crypt = subprocess.check_output(['openssl', 'passwd', '-6', PASSWORD], text=True).strip()
        self.playing = set()
        self.reports = {}   # by way: what the report of an order without a fault says


class Case:
    def __init__(self, tools, number, way, server, fault, careful):
        self.tools, self.number, self.way, self.server, self.fault, self.careful = tools, number, way, server, fault, careful
        self.part = way     # of the table
        self.folder = tools.scratch / f'{number:04}'
        self.data = self.folder / 'data'
        self.proof = self.data / '2000lumora/000.jpg'
        self.arrived = self.folder / ('account/' + ACCOUNT if way == 'ftp' else 'uploads')
        self.foreign = self.first_proof = self.ftp = self.relay = self.program = None

    # --- the two ends

    def open(self):
        shutil.rmtree(self.folder, ignore_errors=True)
        for name in ('runtime', 'data', 'uploads', 'account/' + ACCOUNT):
            (self.folder / name).mkdir(parents=True, mode=0o700)
        shutil.copytree(self.tools.pictures, self.data / 'shown')
        acts = {word: Act(*spec) for word, spec in self.fault.acts.items()}
        self.web = WebLab(self.folder / 'uploads', acts if self.way == 'http' else {}, self)
        if self.way == 'ftp':
            account = self.folder / 'account'
            self.ftp = ScriptedFtp(account) if self.server == 'scripted' else \
                RealFtp(self.server, account, self.folder / 'server', self.tools.unpacked, self.tools.crypt,
                        not self.fault.as_installed)
            self.relay = Relay(self.ftp.port, acts, self, '::1' if self.fault.host == 'ipv6' else '127.0.0.1')

    def close(self):
        for end in (self.relay, self.ftp, self.web):
            if end:
                end.stop()

    def abandon(self):
        if self.program:
            self.program.kill()
        self.close()

    def heal(self):
        self.web.acts = {}
        if self.relay:
            self.relay.acts = {}

    def host(self, healed):
        if self.way == 'http':
            return '127.0.0.1:9'
        if self.fault.host == 'ipv6':
            return f'[::1]:{self.relay.port}'
        if healed or self.fault.host == 'relay':
            return f'127.0.0.1:{self.relay.port}'
        listener, port = listen(backlog=0)
        if self.fault.host == 'closed':
            listener.close()
        else:
            # Whoever comes when nobody takes the first ones out of the queue gets no answer at all.
            self.queue = [listener] + [socket.socket() for _ in range(3)]
            for waiting in self.queue[1:]:
                waiting.setblocking(False)
                waiting.connect_ex(('127.0.0.1', port))
        return f'127.0.0.1:{port}'

    # --- what lies where

    def local_order(self):
        return max((path for path in self.data.glob('2000lumora/!!000/*') if path.is_dir()), default=None)

    def local_files(self):
        """Name -> bytes of all that has to arrive."""
        order = self.local_order()
        files = {path.name: path.read_bytes() for path in order.iterdir()
                 if path.is_file() and path.name[0] != '.' and path.name not in ('kashloo.txt', 'filelisthom.txt')} if order else {}
        if self.way == 'ftp' and self.proof.is_file():
            files['000.jpg'] = self.proof.read_bytes()
        return files

    def is_whole(self, name):
        local = self.local_files().get(name)
        remote = self.arrived / self.local_order().name / name
        if local is None or not remote.is_file():
            return False
        # A resend draws the small picture anew and leaves the one that has arrived where it is.
        return remote.read_bytes() in (local, self.first_proof if name == '000.jpg' else local)

    def put_foreign_order(self):
        """What another customer's order has left in the folder: the same names, other pictures."""
        folder = self.arrived / self.local_order().name
        folder.mkdir()
        self.foreign = {folder / name: b'another customer' + content[:1000] for name, content in self.local_files().items()}
        for path, content in self.foreign.items():
            path.write_bytes(content)

    def put_stray(self):
        (self.arrived / self.local_order().name / STRAY).write_bytes(b'stray')

    # --- the program

    def play(self, *scenarios, healed=False, **environment):
        """Plays scenarios to the end of a sending. True: it came to one."""
        said = self.folder / 'said'
        said.unlink(missing_ok=True)
        lab = LAB.format(host=self.host(healed), user=self.ftp.user if self.ftp else 'lab', password=PASSWORD, account=ACCOUNT,
                         web=f'127.0.0.1:{self.web.port}', sender=self.way, data=self.data)
        lab += '[Guards]\nCareful = yes\n' if self.careful else ''
        if self.tools.type_is_known and self.server in ('pure-ftpd', 'proftpd') and not self.fault.as_installed:
            lab = lab.replace('[Addresses]', 'Type = I\n[Addresses]')
        (self.folder / 'lab.ini').write_text(lab)
        (self.folder / 'lab.ini').chmod(0o600)
        clock = 10 if healed else self.fault.clock
        environment = dict(os.environ, XDG_RUNTIME_DIR=str(self.folder / 'runtime'), LD_PRELOAD=str(self.tools.quick_time),
                           MATRIX_CLOCK=str(clock), **environment)
        with open(self.folder / 'out', 'ab') as out:
            self.program = subprocess.Popen(
                [self.tools.drive, '--lab', self.folder / 'lab.ini', *(FOLDER / f'{name}.scenario' for name in scenarios)],
                cwd=self.folder, env=environment, stdout=out, stderr=out)
        try:
            self.status = self.program.wait(self.fault.limit)
        except subprocess.TimeoutExpired:
            self.program.kill()
            self.program.wait()
            self.status = f'STILL SENDING after {self.fault.limit * clock // 60} minutes'
        self.said = said.read_text(encoding='utf-8').strip() if said.is_file() else ''
        return self.status == 0 and bool(self.said)

    # --- the verdict

    def missing(self):
        """What of the order the server lacks."""
        local, order = self.local_files(), self.local_order()
        prints = [name for name in local if name[0] != '!' and name.endswith('.jpp')]
        if not order or len(prints) != PICTURES or not any(name[0] == '!' for name in local) or f'{order.name}.txt' not in local:
            return [HERE]
        return [name for name in local if not self.is_whole(name)]

    def told(self):
        """How the sending ended in the program's words: arrived, there (without reports), not."""
        if 'whole order has arrived' in self.said:
            return 'arrived'
        return 'there' if 'are on the server' in self.said else 'not'

    def verdict(self, ended):
        if not ended:
            words = (self.folder / 'out').read_text(errors='replace').strip().split('\n')[-1]
            if 'found page MoogMeret' in words:
                return 'nothing of it can be chosen'
            return self.status if isinstance(self.status, str) else f'ENDS EARLY: {self.status} ' + re.sub(r'.*\.scenario:', '', words)[:90]
        missing = self.missing()
        if self.told() == 'not':
            return 'told not arrived' if missing else 'whole, but told not arrived'
        if missing:
            return 'LIE: an order that is not whole here' if missing == [HERE] else \
                f'LIE: {"one file" if len(missing) == 1 else "files"} missing or damaged'
        return 'arrived whole' if self.told() == 'arrived' else 'whole, told so, no report'

    def beside(self, reports):
        """What must not be, whatever the verdict: too many puts, names that have no business there, too many or few reports."""
        found = []
        twice = sum(already for _, already in (self.relay or self.web).puts)
        if twice and not self.fault.again:
            found.append(f'{twice} sent twice')
        theirs = {path.name for path in self.foreign or {}}
        there = {path.name for path in self.arrived.glob('*/*') if not path.name.startswith('filelist')}
        aliens = sorted(there - set(self.local_files()) - theirs - {STRAY})
        if aliens and self.fault.heals:
            found.append('there without need: ' + ', '.join(aliens))
        if any(path.read_bytes() != content for path, content in (self.foreign or {}).items()):
            found.append("another's order overwritten")
        return found + self.wrong_reports(reports)

    def wrong_reports(self, wanted):
        for _ in range(20):    # a request is noted as it is answered
            orders = [path.partition('?')[2] for route, path in self.web.asked if route == 'REPORT' and '?' in path]
            done = [path for route, path in self.web.asked if route == 'DONE']
            if min(len(orders), len(done)) >= wanted:
                break
            time.sleep(0.02)
        if (len(orders), len(done)) != (wanted, wanted):
            return ['not reported' if not orders and not done else f'{len(orders)} reports, {len(done)} done calls']
        if not orders or not self.careful:
            return []
        names = [path.name for path in self.data.glob('2000lumora/!!000/*') if path.is_dir()]
        texts = [re.sub('|'.join(map(re.escape, names)), 'ORDER', text) for text in orders]
        usual = self.tools.reports.setdefault(self.way, texts[-1])
        return ['another report than that of a new order'] if any(text != usual for text in texts) else []

    def run(self):
        self.begun = time.time()
        self.open()
        self.tools.playing.add(self)
        try:
            self.play_case()
        finally:
            self.tools.playing.remove(self)
            self.close()
        self.text = '; '.join([self.result, *self.found])
        self.seconds = time.time() - self.begun
        lie = 'LIE' in self.text or 'no report' in self.text
        self.good = not self.found and not re.search('STILL|EARLY|by resend (told|whole)', self.text) and \
            (not lie or bool(self.fault.literal)) and (not self.survived() or self.text == 'arrived whole')
        if self.good:
            shutil.rmtree(self.folder, ignore_errors=True)
        return self

    def survived(self):
        """Without a fault, and with Careful behind one that comes once, the order arrives at the first sending."""
        return self.fault.name == 'no fault' or (self.careful and self.fault.name.endswith(', once'))

    def play_case(self):
        ended = self.play('plain' if self.way == 'ftp' else 'edited', self.way)
        self.result = self.verdict(ended)
        told = self.told() if ended else ''
        self.found = self.beside(1 if told == 'arrived' else 0) if ended else []
        if told == 'not' and self.fault.heals:
            self.heal()
            self.first_proof = self.local_files().get('000.jpg')
            self.result += ', by resend ' + self.verdict(self.play('again', self.way, healed=True))
            self.found = self.beside(1)


class Kill(Case):
    """The program is killed once, started again, goes on with what it offers, and takes one more order."""

    def __init__(self, tools, number, point, at, careful):
        moment = f'rename {abs(at)}' if 'rename' in point else f'file {at}'
        super().__init__(tools, number, 'ftp', 'scripted', Fault(f'killed {point.split()[0]} {moment}'), careful)
        self.part = 'kill'
        self.environment = {'MATRIX_KILL': str(at)} if 'rename' in point else {}
        if not self.environment:
            self.fault.acts['STOR'] = ({'before': self.before, 'in': self.within, 'behind': self.behind}[point], 1, at)

    def before(self, session, line):
        self.program.kill()
        raise OSError

    def within(self, session, line):
        # Not all that the dead program's socket still holds comes through.
        return session.forward(line, change=lambda content: self.program.kill() or content[:len(content) // 2])

    def behind(self, session, line):
        session.forward(line)
        self.program.kill()
        return True

    def run(self):
        super().run()
        self.good = self.text in ('arrived whole', 'nothing was begun', NOT_KNOWN)
        return self if self.result else None

    def play_case(self):
        self.result, self.found = '', []
        if self.play('plain', 'ftp', **self.environment):
            return    # there are not so many renames
        first = self.local_order()
        arrived = False
        # While the customer still chooses there is no order, and its folder may have been made just before.
        self.result = 'nothing was begun'
        begun = first and any(path.name == '.order' or path.name[0] != '.' for path in first.iterdir())
        state = (first / '.order').read_bytes() if begun else b''
        if b'"Phase","reported"' in state or b'"Report","begun"' in state:
            # It has arrived, and a report that may have been heard is not sent twice: nothing is offered.
            arrived = any(route == 'REPORT' and '?' in path for route, path in self.web.asked)
            self.result = 'arrived whole' if b'"Phase","reported"' in state else NOT_KNOWN
            if self.missing():
                self.result = 'LIE: files missing or damaged'
        elif begun:
            self.first_proof = self.local_files().get('000.jpg')
            self.result = self.verdict(self.play('goon', 'ftp', healed=True))
            arrived = self.told() == 'arrived'
            self.found = self.beside(1 if arrived else 0)
        next_one = self.verdict(self.play('plain', 'ftp', healed=True))
        if begun and self.local_order() == first:
            self.found.append('its number and folder taken by the next order')
        elif next_one != 'arrived whole':
            self.found.append('the next order: ' + next_one)
        self.found += self.wrong_reports(1 + arrived)
        if list(self.data.rglob('.lumora-*.tmp')):
            self.found.append('a temporary file left')
