"""Two programs at once: in one workspace, and in two whose orders would bear one name on the server."""
import select
import shutil
import socket
import threading

from cases import ANOTHER, CUSTOMER, FOLDER, Case, Workspace
from faults import Fault
from kills import ORDERS
from relay import Act, Relay

IN_USE = 3   # the program's status where another one has the data folder


class Pair(Case):
    """Two orders, each with its own pictures; each has to arrive whole in a folder of its own and to be reported once."""

    def __init__(self, tools, number, name, play, order, way, server, careful):
        super().__init__(tools, number, way, server, Fault(f'{name}, {ORDERS[order, way]}'), careful)
        self.part, self.order_of, self.plays = 'pair', order, play
        self.other = Workspace(self.folder, tools, way, 'other')
        self.other.data = None
        self.second_relay = None

    def workspaces(self):
        return [self.mine, self.other] if self.other.data not in (None, self.mine.data) else [self.mine]

    def open(self):
        super().open()
        if self.ftp:
            self.second_relay = Relay(self.ftp.port, {}, self, '127.0.0.1')
            self.relay.lab = self.second_relay.lab = self

    def close(self):
        super().close()
        if self.second_relay:
            self.second_relay.stop()

    def is_whole(self, name):
        return False    # whose file it is cannot be told here; the bytes at the end tell

    # --- what is played

    def make_other(self, clone=False, mark=False):
        """The second workspace. clone: a copy of all that the first one holds; mark: bears the first one's mark."""
        self.other.make(self.tools.other_pictures)
        self.other.data = self.other.home
        if clone:
            shutil.copytree(self.mine.data, self.other.data, dirs_exist_ok=True, ignore=lambda *_: ['shown', 'said'])
        if mark:
            shutil.copy2(self.mine.data / '.lumora-mark', self.other.data)

    def share(self):
        """The second program works in the first one's workspace, for a customer who has other pictures."""
        self.other.make(self.tools.other_pictures)
        self.other.data = self.mine.data

    def begin(self, workspace, **more):
        host = None
        if self.way == 'ftp':
            host = f'127.0.0.1:{(self.relay if workspace is self.mine else self.second_relay).port}'
        order = self.order_of if workspace is self.mine else self.of_another_customer()
        return workspace.begin(order, self.way, lab=self.lab(workspace, host=host), **more)

    def of_another_customer(self):
        """Logs of one customer and one second would be one text."""
        scenario = self.folder / 'another.scenario'
        scenario.write_text((FOLDER / f'{self.order_of}.scenario').read_text().replace(CUSTOMER, ANOTHER))
        return scenario

    def send(self, workspace, **more):
        self.begin(workspace, **more)
        return workspace.end()

    def hold(self, word, first, times=1):
        """The first program is held at a command until the event it gives is set; its other event tells that it is there."""
        there, go_on = threading.Event(), threading.Event()

        def act(session, *_):
            there.set()
            go_on.wait(100)
            line = session.client.socket if self.ftp else session.connection
            # By FTP a program that waits for an answer says no more than QUIT; of a post its body is still to come.
            if select.select([line], [], [], 0)[0] and (self.ftp or not line.recv(1, socket.MSG_PEEK)):
                raise OSError    # the program has given up: the server must not begin now

        acts = self.relay.acts if self.way == 'ftp' else self.web.acts
        acts[word] = Act(act, times, first)
        return there, go_on

    def put(self):
        return 'STOR' if self.way == 'ftp' else 'POST'

    # --- the verdict

    def tell(self, workspace, ended, order):
        """What became of a program's order."""
        if workspace.status == IN_USE:
            return 'refused'
        if not ended:
            self.mine, mine = workspace, self.mine
            text, self.mine = self.verdict(False), mine
            return text
        if not order or not workspace.is_whole_here(order):
            return 'not whole on its own machine'
        there = self.arrived / order.name
        local = workspace.files(order)
        remote = {path.name: path.read_bytes() for path in there.glob('*') if not path.name.startswith('filelist')}
        # The small picture is one file a workspace and is proven by its name.
        whole = all(name in remote and (remote[name] == content or name == '000.jpg') for name, content in local.items())
        if workspace.told() == 'not':
            return 'told not arrived'
        if not whole:
            return 'LIE'
        if set(remote) - set(local):
            return 'mixed with others'
        return 'arrived whole' if workspace.told() == 'arrived' else 'whole, no report'

    def judge(self, first, second, wanted=('arrived whole', 'arrived whole'), before=0):
        """before: how many orders had arrived until then."""
        mine, other = self.mine.order(), self.other.order()
        if mine and mine == other and IN_USE not in (self.mine.status, self.other.status):
            mine = self.mine.orders()[-2] if len(self.mine.orders()) > 1 else None
        told = self.tell(self.mine, first, mine), self.tell(self.other, second, other)
        self.found = ['both have one folder name'] if mine and other and mine != other and mine.name == other.name else []
        self.found += self.wrong_reports(before + sum(text == 'arrived whole' for text in told))
        self.result = ' and '.join(told)
        self.as_wanted = told in (wanted, wanted[::-1])

    def run(self):
        self.as_wanted = False
        super().run()
        self.good = self.as_wanted and not self.found
        return self

    def play_case(self):
        self.plays(self)


# --- the ways in which two come together

def at_file(file, join, *wanted):
    """The second program comes when the first one sends this file; at its first file the folder is empty by FTP, not made by HTTP."""
    def play(case):
        there, go_on = case.hold(case.put(), file)
        case.begin(case.mine)
        there.wait(100)
        join(case)
        second = case.send(case.other)
        go_on.set()
        case.judge(case.mine.end(), second, *wanted)
    return play


def one_mark(case):
    case.make_other(mark=True)


one_workspace = at_file(2, Pair.share, ('arrived whole', 'refused'))


def one_workspace_at_once(case):
    """Two programs start at the same moment."""
    case.share()
    case.begin(case.mine)
    case.begin(case.other)
    second = case.other.end()
    case.judge(case.mine.end(), second, ('arrived whole', 'refused'))


def one_serial(case):
    """Two data folders with one mark, one order after the other."""
    first = case.send(case.mine)
    one_mark(case)
    case.judge(first, case.send(case.other))


def one_serial_both_ask(case):
    """Both have found no folder when the first file of each arrives."""
    case.send(case.mine)
    case.make_other(clone=True)
    both = threading.Barrier(2)

    def act(session):
        both.wait(100)

    case.web.acts['POST'] = Act(act, 2)
    case.begin(case.mine)
    case.begin(case.other)
    second = case.other.end()
    case.judge(case.mine.end(), second, before=1)


def cloned(case):
    """The data folder, in which an order was made, is copied onto another machine, which has other cards."""
    cards = case.folder / 'cards'
    for name, address in (('first', '52:54:00:00:00:01'), ('second', '52:54:00:00:00:02')):
        (cards / name / 'card/device/bus').mkdir(parents=True)
        (cards / name / 'card/device/subsystem').symlink_to('bus')
        (cards / name / 'card/address').write_text(address + '\n')

    def machine(name):
        script = 'mount --bind "$0" /sys/class/net && exec "$@"'
        return ['unshare', '-m', 'sh', '-c', script, str(cards / name)]

    case.send(case.mine, before=machine('first'))
    case.make_other(clone=True)
    first = case.send(case.mine, before=machine('first'))
    case.judge(first, case.send(case.other, before=machine('second')), before=1)


PAIRS = [
    ('a second program in one workspace', one_workspace, (('plain', 'ftp'), ('edited', 'http'))),
    ('two programs in one workspace start at once', one_workspace_at_once, (('plain', 'ftp'),)),
    ('one serial, one order after the other', one_serial, (('plain', 'ftp'), ('edited', 'ftp'), ('edited', 'http'))),
    ('one serial, in the middle of the first order', at_file(3, one_mark), (('plain', 'ftp'), ('edited', 'http'))),
    ('one serial, the first folder still empty', at_file(1, one_mark), (('plain', 'ftp'), ('edited', 'http'))),
    ('one serial, both ask before either has sent', one_serial_both_ask, (('edited', 'http'),)),
    ('a cloned data folder, other network cards', cloned, (('plain', 'ftp'), ('edited', 'http'))),
]
QUICK = (one_workspace, one_serial)
