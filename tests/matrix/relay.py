"""A line to an FTP server with faults: stands between the program and any server and does what the acts of a case say."""
import socket
import threading
import time

from servers import Wire, drop, in_background, listen

ALWAYS = 10**9
DATA = ('STOR', 'LIST', 'RETR', 'NLST')


class Act:
    """What happens at a command: from its first-th coming on, so many times."""

    def __init__(self, do, times=ALWAYS, first=1):
        self.do, self.times, self.first = do, times, first
        self.come = 0
        self.lock = threading.Lock()

    def due(self):
        with self.lock:
            self.come += 1
            return self.first <= self.come < self.first + self.times


class Relay:
    """acts: command -> Act. The words CONNECT and GREETING stand for the moments before the first command."""

    def __init__(self, port, acts, lab, host):
        self.server_port, self.acts, self.lab, self.host = port, acts, lab, host
        self.puts, self.confirmed = [], set()    # puts: name, whether the server held it whole and had said so
        self.open = []
        self.listener, self.port = listen(host)
        self.ended = threading.Event()
        in_background(self.accept)

    def accept(self):
        while True:
            try:
                connection = self.listener.accept()[0]
            except OSError:
                return
            in_background(Session(self, connection).run)

    def stop(self):
        self.ended.set()
        drop(self.listener, False)

    def due(self, word):
        act = self.acts.get(word)
        return act.do if act and act.due() else None


class Session:
    def __init__(self, relay, connection):
        self.relay = relay
        self.client = Wire(connection)
        self.server = None
        self.data_port = 0
        self.listener = None

    def run(self):
        self.relay.open.append(self)
        try:
            act = self.relay.due('CONNECT')
            if act and act(self, ''):
                return
            self.server = Wire(socket.create_connection(('127.0.0.1', self.relay.server_port)))
            self.one('GREETING', '')
            while line := self.client.line():
                self.one(line.split(' ')[0].upper(), line)
        except (OSError, ValueError):
            pass
        finally:
            self.relay.open.remove(self)
            self.close()

    def close(self, reset=False):
        for wire in (self.client, self.server):
            if wire:
                wire.close(reset)

    def cut(self):
        self.close(True)
        raise OSError

    def one(self, word, line):
        relay, name = self.relay, line[5:]
        self.code = ''
        if word == 'STOR':
            relay.puts.append((name, name in relay.confirmed and relay.lab.is_whole(name)))
        elif word == 'DELE':
            relay.confirmed.discard(name)
        act = relay.due(word)
        if not act or not act(self, line):
            self.forward(line)
        if word == 'STOR' and self.code[:1] == '2':
            relay.confirmed.add(name)

    def tell(self, text):
        self.client.tell(text)
        self.code = text[:3]

    def forward(self, line, answer=None, **options):
        """Passes a command on and its reply back. answer: changes the text of the last reply; an empty one cuts the line."""
        word = line.split(' ')[0].upper()
        if word in DATA:
            return self.transfer(line, answer, **options)
        if line:
            self.server.tell(line)
        text = self.server.reply()
        if word in ('EPSV', 'PASV') and text[:1] == '2':
            text = self.own_port(text)
        return self.back(text, answer)

    def back(self, text, answer):
        text = answer(text) if answer else text
        if not text:
            self.cut()
        self.tell(text)
        return True

    def own_port(self, text):
        inside = text[text.index('(') + 1:text.index(')')]
        extended = text.startswith('229')
        numbers = [0] * 6 if extended else [int(number) for number in inside.split(',')]
        self.data_port = int(inside.strip('|')) if extended else numbers[4] * 256 + numbers[5]
        self.listener, port = listen(self.relay.host)
        if extended:
            return f'229 Entering Extended Passive Mode (|||{port}|)'
        return f'227 Entering Passive Mode (127,0,0,1,{port // 256},{port % 256})'

    def transfer(self, line, answer, change=None, cut=None, stall=None, rate=None, linger=0, reset_server=True, dies=None):
        """change: of all the bytes; cut: the data line breaks after so many of them; stall: nothing moves any more after so many;
        rate: bytes a second; linger: seconds until the data line of a listing ends in the server's mind; dies: ends the program, of which
        the server hears nothing."""
        inwards = line[:4].upper() == 'STOR'
        far = socket.create_connection(('127.0.0.1', self.data_port))
        self.server.tell(line)
        begin = self.server.reply()
        self.tell(begin)
        if begin[:1] != '1':
            drop(far, False)
            return True
        near = self.listener.accept()[0]
        self.listener.close()
        if rate:
            near.setsockopt(socket.SOL_SOCKET, socket.SO_RCVBUF, 8192)
        source, target = (near, far) if inwards else (far, near)
        passed = 0
        whole = b''
        try:
            while piece := source.recv(min(rate // 10, 65536) if rate else 65536):
                if change:
                    whole += piece
                    continue
                limit = cut if cut is not None else stall
                if limit is not None and passed + len(piece) >= limit:
                    target.sendall(piece[:limit - passed])
                    if stall is not None:
                        self.wait_for_the_end()
                    time.sleep(0.02)
                    drop(near)
                    drop(far, reset_server)
                    break
                target.sendall(piece)
                passed += len(piece)
                if rate:
                    time.sleep(len(piece) / rate)
            else:
                if change:
                    target.sendall(change(whole))
                if dies:
                    dies()
                    self.relay.ended.wait()
                if linger and not inwards:
                    self.linger(near, linger)
                drop(far, False)
                if not inwards:
                    drop(near, False)
            text = self.server.reply()
            return self.back(text, answer)
        finally:
            near.close()
            far.close()

    def linger(self, near, seconds):
        """Ends the program's data line and waits until it has ended its side, for so long at most."""
        near.shutdown(socket.SHUT_WR)
        near.settimeout(seconds)
        try:
            near.recv(1)
        except OSError:
            pass

    def wait_for_the_end(self):
        """Silence until the program gives up."""
        while self.client.socket.recv(4096):
            pass
        raise OSError
