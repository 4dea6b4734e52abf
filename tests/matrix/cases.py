"""One case: a whole order sent by lumora-drive before a server and a line with a fault, and what became of it."""
import os
import pathlib
import re
import shutil
import socket
import subprocess
import time

from faults import STRAY
from relay import Act, Relay
from servers import ACCOUNT, PASSWORD, RealFtp, ScriptedFtp, WebLab, listen

PICTURES = 3
HERE = 'the order on this machine'
OWN = ('kashloo.txt', 'filelisthom.txt')    # the program's, which never travel
SMALL = 'arrived, the small picture damaged'
FOLDER = pathlib.Path(__file__).resolve().parent
CUSTOMER, ANOTHER = 'Dana Levi', 'Ruth Levi'   # of the scenarios; of the second one of two
LAB = (FOLDER / 'lab.ini.in').read_text()


class Tools:
    """The programs under test and what all cases share."""

    def __init__(self, drive, quick_time, pictures, scratch, unpacked, kept, lines):
        self.drive, self.quick_time, self.scratch, self.unpacked, self.kept = drive, quick_time, scratch, unpacked, kept
        self.make_pictures, self.lines = pictures, lines
        self.pictures, self.other_pictures = self.shown('shown', PICTURES, '0.2'), self.shown('shown-other', PICTURES, '0.1')
        self.crypt = subprocess.check_output(['openssl', 'passwd', '-6', PASSWORD], text=True).strip()
        self.playing = set()
        self.reports = {}   # by way: what the report of an order without a fault says

    def shown(self, name, count, megapixels):
        subprocess.run([self.make_pictures, self.scratch / name, str(count), megapixels], check=True, stdout=subprocess.DEVNULL)
        return self.scratch / name


class Workspace:
    """A data folder, the lab's file for it, and the program that works in it."""

    def __init__(self, folder, tools, way, name='data'):
        self.tools, self.way, self.folder = tools, way, folder
        self.home = self.data = folder / name    # where the program is started, and its data folder
        self.lab, self.out, self.runtime = folder / f'{name}.ini', folder / f'{name}.out', folder / f'{name}.runtime'
        self.program = None
        self.damaged = set()    # names of files that count as lost here
        self.status, self.said, self.hurry = None, '', 1

    def make(self, pictures=None):
        for folder in (self.runtime, self.home):
            folder.mkdir(parents=True, mode=0o700)
        shutil.copytree(pictures or self.tools.pictures, self.home / 'shown')
        return self

    def orders(self):
        """The folders by their numbers, which follow the "^"."""
        return sorted((path for path in self.data.glob('2000lumora/!!000/*') if path.is_dir()),
                      key=lambda path: int(re.search(r'\^(\d+)', path.name)[1]))

    def order(self):
        return next(reversed(self.orders()), None)

    def files(self, order=None):
        """Name -> bytes of all that has to arrive."""
        order = order or self.order()
        files = {path.name: path.read_bytes() for path in order.iterdir()
                 if path.is_file() and path.name[0] != '.' and path.name not in OWN and path.name not in self.damaged} if order else {}
        proof = self.data / '2000lumora/000.jpg'
        if self.way == 'ftp' and proof.is_file():
            files['000.jpg'] = proof.read_bytes()
        return files

    def is_whole_here(self, order=None, pictures=PICTURES):
        order = order or self.order()
        local = self.files(order)
        prints = [name for name in local if name[0] != '!' and name.endswith('.jpp')]
        return order is not None and len(prints) == pictures and any(name[0] == '!' for name in local) and f'{order.name}.txt' in local

    def begin(self, *scenarios, lab, hurry=10, before=(), **environment):
        """Starts the program, which plays the scenarios. before: words of the command line in front of it."""
        (self.home / 'said').unlink(missing_ok=True)
        self.lab.write_text(lab)
        self.lab.chmod(0o600)
        environment = dict(os.environ, XDG_RUNTIME_DIR=str(self.runtime), **environment)
        self.hurry = hurry
        if hurry > 1 or 'MATRIX_KILL' in environment or 'MATRIX_RENAMES' in environment:
            environment.update(LD_PRELOAD=str(self.tools.quick_time), MATRIX_CLOCK=str(hurry))
        paths = [FOLDER / f'{name}.scenario' if isinstance(name, str) else name for name in scenarios]
        with open(self.out, 'ab') as out:
            self.program = subprocess.Popen([*before, self.tools.drive, '--lab', self.lab, *paths], cwd=self.home, env=environment,
                                            stdout=out, stderr=out)
        return self

    def end(self, limit=150):
        """Waits for the program's end. True: it told how a sending ended."""
        try:
            self.status = self.program.wait(limit)
        except subprocess.TimeoutExpired:
            self.kill()
            self.program.wait()
            self.status = f'STILL SENDING after {limit * self.hurry // 60} minutes'
        said = self.home / 'said'
        self.said = said.read_text(encoding='utf-8').strip() if said.is_file() else ''
        return self.status == 0 and bool(self.said)

    def kill(self):
        if self.program:
            self.program.kill()

    def last_words(self):
        return self.out.read_text(errors='replace').strip().split('\n')[-1]

    def told(self):
        """How the sending ended in the program's words: arrived, there (without reports), not."""
        if 'whole order has arrived' in self.said or 'Your order has arrived' in self.said:    # the lab told, or perhaps not
            return 'arrived'
        return 'there' if 'are on the server' in self.said else 'not'


class Case:
    def __init__(self, tools, number, way, server, fault, careful):
        self.tools, self.number, self.way, self.server, self.fault, self.careful = tools, number, way, server, fault, careful
        self.part = way     # of the table
        self.folder = tools.scratch / f'{number:04}'
        self.mine = Workspace(self.folder, tools, way)
        self.arrived = self.folder / ('account/' + ACCOUNT if way == 'ftp' else 'uploads')
        self.allowed = []    # what is told and does not fail
        self.foreign = self.first_proof = self.ftp = self.relay = self.pictures = None
        self.order_of = 'plain' if way == 'ftp' else 'edited'   # the scenario
        self.count = PICTURES
        self.kept = tools.kept    # the FTP session
        self.switches = ''    # more of the lab's file

    # --- the two ends

    def open(self):
        shutil.rmtree(self.folder, ignore_errors=True)
        for name in ('uploads', 'account/' + ACCOUNT):
            (self.folder / name).mkdir(parents=True, mode=0o700)
        self.mine.make(self.pictures)
        acts = self.acts = {word: Act(*(self.of_session(part) for part in spec)) for word, spec in self.fault.acts.items()}
        self.web = WebLab(self.folder / 'uploads', acts if self.way == 'http' else {}, self)
        if self.way == 'ftp':
            account = self.folder / 'account'
            self.ftp = ScriptedFtp(account) if self.server == 'scripted' else \
                RealFtp(self.server, account, self.folder / 'server', self.tools.unpacked, self.tools.crypt,
                        not self.fault.as_installed)
            self.relay = Relay(self.ftp.port, acts, self, '::1' if self.fault.host == 'ipv6' else '127.0.0.1')

    def of_session(self, part):
        """Of a pair the number that is meant, which a function may tell for a kept session."""
        number = part[self.kept] if isinstance(part, tuple) else part
        return number(self) if isinstance(part, tuple) and callable(number) else number

    def takes_type_i(self):
        return self.server in ('pure-ftpd', 'proftpd') and not self.fault.as_installed

    def close(self):
        for end in (self.relay, self.ftp, self.web):
            if end:
                end.stop()

    def abandon(self):
        for workspace in self.workspaces():
            workspace.kill()
        self.close()

    def workspaces(self):
        return [self.mine]

    def heal(self):
        self.web.acts = {}
        if self.relay:
            self.relay.acts = {}

    def host(self, healed):
        """Of the server that takes the files."""
        port = (self.relay or self.web).port
        if self.fault.host == 'ipv6':
            return f'[::1]:{port}'
        if healed or self.fault.host == 'relay':
            return f'127.0.0.1:{port}'
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

    def is_whole(self, name):
        local = self.mine.files().get(name)
        remote = self.arrived / self.mine.order().name / name
        if local is None or not remote.is_file():
            return False
        # A resend draws the small picture anew and leaves the one that has arrived where it is.
        return remote.read_bytes() in (local, self.first_proof if name == '000.jpg' else local)

    def put_foreign_order(self):
        """What another customer's order has left in the folder: the same names, other pictures."""
        folder = self.arrived / self.mine.order().name
        folder.mkdir()
        self.foreign = {folder / name: b'another customer' + content[:1000] for name, content in self.mine.files().items()}
        for path, content in self.foreign.items():
            path.write_bytes(content)

    def put_stray(self):
        (self.arrived / self.mine.order().name / STRAY).write_bytes(b'stray')

    # --- the program

    def lab(self, workspace=None, healed=False, host=None):
        """The text of the lab's file."""
        workspace = workspace or self.mine
        host = host or self.host(healed)
        text = LAB.format(host=host if self.ftp else '127.0.0.1:9', upload=host, user=self.ftp.user if self.ftp else 'lab', password=PASSWORD,
                          account=ACCOUNT, web=f'127.0.0.1:{self.web.port}', sender=self.way, data=workspace.data)
        text = text.replace('[Switches]\n', '[Switches]\n' + self.switches)
        text += '[Guards]\nCareful = yes\n' if self.careful else ''
        if self.takes_type_i():
            text = text.replace('[Addresses]', 'Type = I\n[Addresses]')
        if self.kept:
            text = text.replace('[Addresses]', f'Session = kept\nLines = {self.tools.lines}\n[Addresses]')
        return text

    def play(self, *scenarios, healed=False, **environment):
        """Plays scenarios to the end of a sending. True: it came to one."""
        self.mine.begin(*scenarios, lab=self.lab(healed=healed), hurry=10 if healed else self.fault.clock, **environment)
        return self.mine.end(self.fault.limit)

    # --- the verdict

    def missing(self):
        """What of the order the server lacks."""
        return [name for name in self.mine.files() if not self.is_whole(name)] if self.mine.is_whole_here() else [HERE]

    def verdict(self, ended):
        if not ended:
            words, status = self.mine.last_words(), self.mine.status
            if 'found page MoogMeret' in words:
                return 'nothing of it can be chosen'
            if 'Command4Hemshech is hidden' in words:
                return 'nothing is offered'
            return status if isinstance(status, str) else f'ENDS EARLY: {status} ' + re.sub(r'.*\.scenario:', '', words)[:90]
        missing = self.missing()
        if self.mine.told() == 'not':
            return 'told not arrived' if missing else 'whole, but told not arrived'
        if missing == ['000.jpg'] and (self.arrived / self.mine.order().name / '000.jpg').is_file():
            return SMALL
        if missing:
            return 'LIE: an order that is not whole here' if missing == [HERE] else \
                f'LIE: {"one file" if len(missing) == 1 else "files"} missing or damaged'
        return 'arrived whole' if self.mine.told() == 'arrived' else 'whole, told so, no report'

    def beside(self, reports):
        """What must not be, whatever the verdict: too many puts, names that have no business there, too many or few reports."""
        found, self.allowed = [], []
        twice = sum(already for _, already in (self.relay or self.web).puts)
        if twice:
            (found if twice > self.fault.again else self.allowed).append(f'{twice} sent twice')
        theirs = {path.name for path in self.foreign or {}}
        there = {path.name for path in self.arrived.glob('*/*') if not path.name.startswith('filelist')}
        aliens = sorted(there - set(self.mine.files()) - theirs - {STRAY})
        if aliens and self.fault.heals:
            found.append('there without need: ' + ', '.join(aliens))
        if any(path.read_bytes() != content for path, content in (self.foreign or {}).items()):
            found.append("another's order overwritten")
        return found + self.wrong_reports(reports)

    def never_came(self):
        """True where a thing was never done, at none of its commands. As built in the server is asked for no length and no log, by a kept
        session for no length that a listing tells."""
        unasked = ('SIZE', 'HEAD', 'RETR') if not self.careful else ('SIZE',) if self.kept and self.way == 'ftp' else ()
        done = {act.do for word, act in self.acts.items() if act.come >= act.first or word in unasked}
        return any(act.do not in done for act in self.acts.values())

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
        names = [order.name for workspace in self.workspaces() for order in workspace.orders()]
        texts = [re.sub('|'.join(map(re.escape, names)), 'ORDER', text).replace(ANOTHER[:4], CUSTOMER[:4]) for text in orders]
        usual = self.tools.reports.setdefault((self.way, self.order_of, self.count), texts[-1])
        return ['another report than that of a new order'] if any(text != usual for text in texts) else []

    def run(self):
        self.begun = time.time()
        self.open()
        self.tools.playing.add(self)
        try:
            self.play_case()
            self.found += ['THE FAULT NEVER CAME'] if self.never_came() else []
        finally:
            self.tools.playing.remove(self)
            self.close()
        self.text = '; '.join([self.result, *self.allowed, *self.found])
        self.seconds = time.time() - self.begun
        lie = 'LIE' in self.text or SMALL in self.text or 'no report' in self.text
        self.good = not self.found and not re.search('STILL|EARLY|by resend (told|whole)', self.text) and \
            (not lie or bool(self.fault.literal)) and (not self.survived() or self.result == 'arrived whole')
        if self.good:
            shutil.rmtree(self.folder, ignore_errors=True)
        return self

    def survived(self):
        """Without a fault, and with Careful after one that comes once, the order arrives at the first sending."""
        return self.fault.name == 'no fault' or (self.careful and self.fault.name.endswith(', once'))

    def play_case(self):
        if self.fault.plays:
            return self.fault.plays(self)
        ended = self.play(self.order_of, self.way)
        self.result = self.verdict(ended)
        told = self.mine.told() if ended else ''
        self.found = self.beside(1 if told == 'arrived' else 0) if ended else []
        if told == 'not' and self.fault.heals:
            self.heal()
            self.result += ', by resend ' + self.send_again('later', 'again')

    def send_again(self, *scenarios):
        """What becomes of the order that is sent once more."""
        self.first_proof = self.mine.files().get('000.jpg')
        ended = self.play(*scenarios, self.way, healed=True)
        self.found = self.beside(1 if ended and self.mine.told() == 'arrived' and not self.switches else 0)
        return self.verdict(ended)
