"""The program is killed once at a given moment, started again, goes on with what it offers, and takes one more order."""
from cases import Case
from faults import Fault

NOT_KNOWN = 'arrived whole, whether the lab was told is not known'
FOUND_THERE = 'arrived whole, found there and not reported'   # as built in by HTTP
GOOD = ('arrived whole', 'nothing was begun', NOT_KNOWN, FOUND_THERE)
ORDERS = {('plain', 'ftp'): 'plain order by FTP', ('edited', 'ftp'): 'edited order by FTP', ('edited', 'http'): 'edited order by HTTP'}
FILES = {'ftp': 6, 'http': 5}   # of an order: log, sheet, three prints, by FTP the small picture
POINTS = ('before', 'in', 'after')
QUICK = 3   # the file at which ./test kills


class Undisturbed(Case):
    """An order of which only the renames are of interest."""

    def __init__(self, tools, number, order, way, careful):
        super().__init__(tools, number, way, 'scripted', Fault('no fault'), careful)
        self.order_of = order

    def renames(self):
        """What each rename of the program makes, from the start page to the end of the report."""
        self.open()
        self.tools.playing.add(self)
        try:
            ended = self.play(self.order_of, self.way, MATRIX_RENAMES=str(self.folder / 'renames'))
            if self.verdict(ended) != 'arrived whole':
                raise RuntimeError(f'{ORDERS[self.order_of, self.way]}, undisturbed: {self.verdict(ended)}')
            order = self.mine.order().name
            return [self.word_for(line, order) for line in (self.folder / 'renames').read_text().splitlines()]
        finally:
            self.tools.playing.remove(self)
            self.close()

    @staticmethod
    def word_for(path, order):
        folder, _, name = path.rpartition('/')
        if name == '.order':
            return 'the state'
        if order not in folder:
            return name
        return 'the log' if name == order + '.txt' else 'the sheet' if name[0] == '!' else 'a print' if name.endswith('.jpp') else name


def of_order(order, way, careful, plan):
    """The kills of an order. plan: what its renames make. While a customer still edits no order is begun: that is played once."""
    begins = plan.index('the state') if order == 'edited' and (way, careful) != ('ftp', True) else 0
    for at, made in enumerate(plan, 1):
        for point in ('before', 'after') if at > begins else ():
            yield order, way, 'scripted', point, at, made, careful
    for at in range(1, FILES[way] + 1):
        for point in POINTS:
            yield order, way, 'scripted', point, at, '', careful


def is_quick(order, way, server, point, at, made, careful):
    """A few of each kind, for ./test."""
    return order == 'plain' and at in (QUICK, 2 * QUICK) or way == 'http' and at == QUICK and not made


def before(servers, guards):
    """Real servers hold what a dead program has left: open files, locks, sessions."""
    for server in servers:
        for point in ('in', 'after', 'power cut in'):
            for careful in guards:
                yield 'plain', 'ftp', server, point, QUICK, '', careful


class Kill(Case):
    """order, way: the order that is made. point: where at the at-th rename or the at-th file. made: what that rename makes."""

    def __init__(self, tools, number, order, way, server, point, at, made, careful):
        place = f'rename {at} ({made})' if made else f'file {at}'
        super().__init__(tools, number, way, server, Fault(f'{ORDERS[order, way]}, {point} {place}'), careful)
        self.part, self.order_of, self.point, self.place = 'kill', order, point, place
        # With Careful the server is asked for the length of a file whose put was in hand.
        self.fault.again = 0 if careful else 1
        self.environment = {'MATRIX_KILL': str(at if point == 'before' else -at)} if made else {}
        if not made:
            act = getattr(self, way + '_' + point.replace(' ', '_'))
            self.fault.acts['STOR' if way == 'ftp' else 'POST'] = (act, 1, at)

    def ftp_before(self, session, line):
        self.mine.kill()
        raise OSError

    def ftp_in(self, session, line):
        # Not all that the dead program's socket still holds comes through.
        return session.forward(line, change=lambda content: self.mine.kill() or content[:len(content) // 2])

    def ftp_after(self, session, line):
        session.forward(line)
        self.mine.kill()
        return True

    def ftp_power_cut_in(self, session, line):
        # The server hears nothing of the end: its session, and what it has locked, live on.
        return session.forward(line, change=lambda content: content[:len(content) // 2], dies=self.mine.kill)

    def http_before(self, session):
        self.mine.kill()
        raise OSError

    def http_in(self, session):
        session.store(lambda content: content[:len(content) // 2])
        self.http_before(session)

    def http_after(self, session):
        session.good('POST')
        self.mine.kill()
        return True

    def run(self):
        super().run()
        self.good = self.result in GOOD and not self.found
        return self

    def is_reported(self):
        return any(route == 'REPORT' and '?' in path for route, path in self.web.asked)

    def play_case(self):
        self.result, self.found = 'NOT KILLED', []
        if self.play(self.order_of, self.way, **self.environment) or self.mine.status != -9:
            return
        self.heal()
        first = self.mine.order()
        arrived = False
        # While the customer still chooses there is no order, and its folder may have been made just before.
        self.result = 'nothing was begun'
        begun = first and any(path.name == '.order' or path.name[0] != '.' for path in first.iterdir())
        state = (first / '.order').read_bytes() if begun and (first / '.order').is_file() else b''
        if b'"Phase","reported"' in state or b'"Report","begun"' in state:
            # It has arrived, and a report that may have been heard is not sent twice: nothing is offered.
            arrived = self.is_reported()
            self.result = 'arrived whole' if b'"Phase","reported"' in state else NOT_KNOWN
            if self.missing():
                self.result = 'LIE: files missing or damaged'
        elif begun:
            self.first_proof = self.mine.files().get('000.jpg')
            self.result = self.verdict(self.play('goon', self.way, healed=True))
            arrived = self.mine.told() == 'arrived'
            if arrived and self.way == 'http' and not self.careful and not self.is_reported():
                self.result, arrived = FOUND_THERE, False
            self.found = self.beside(1 if arrived else 0)
        last = self.verdict(self.play(self.order_of, self.way, healed=True))
        if begun and self.mine.order() == first:
            self.found.append('its number and folder taken by the next order')
        elif last != 'arrived whole':
            self.found.append('the next order: ' + last)
        self.found += self.wrong_reports(1 + arrived)
        if list(self.mine.data.rglob('.lumora-*.tmp')):
            self.found.append('a temporary file left')
