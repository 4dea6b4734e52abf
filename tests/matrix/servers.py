"""Servers for the matrix: an FTP server and a web lab of our own, and how the real FTP servers are started. Each keeps what
arrives in a folder."""
import http.server
import os
import pathlib
import socket
import socketserver
import subprocess
import threading
import time
import urllib.parse

ACCOUNT = 'zalamim234'
PASSWORD = 'loopback-lab'


def listen(host='127.0.0.1', port=0, backlog=64):
    family = socket.AF_INET6 if ':' in host else socket.AF_INET
    listener = socket.socket(family, socket.SOCK_STREAM)
    listener.setsockopt(socket.SOL_SOCKET, socket.SO_REUSEADDR, 1)
    listener.bind((host, port))
    listener.listen(backlog)
    return listener, listener.getsockname()[1]


def in_background(function, *arguments):
    threading.Thread(target=function, args=arguments, daemon=True).start()


class Wire:
    """One side of a control line: lines out, lines and whole replies in."""

    def __init__(self, connection):
        self.socket = connection
        self.socket.setsockopt(socket.IPPROTO_TCP, socket.TCP_NODELAY, 1)
        self.file = connection.makefile('rb')

    def line(self):
        return self.file.readline().decode('latin-1').rstrip('\r\n')

    def reply(self):
        """A reply with all its lines; empty when the other side has gone."""
        text = first = self.line()
        while first[3:4] == '-' and not text.split('\n')[-1].startswith(first[:3] + ' '):
            more = self.line()
            if not more:
                return ''
            text += '\n' + more
        return text

    def tell(self, text):
        self.socket.sendall(text.replace('\n', '\r\n').encode('latin-1') + b'\r\n')

    def close(self, reset=False):
        # The reader keeps the socket open as long as it lives.
        self.file.close()
        drop(self.socket, reset)


def drop(connection, reset=True):
    if reset:
        connection.setsockopt(socket.SOL_SOCKET, socket.SO_LINGER, b'\1\0\0\0\0\0\0\0')
    else:
        try:
            connection.shutdown(socket.SHUT_RDWR)
        except OSError:
            pass
    connection.close()


class ScriptedFtp:
    """A good FTP server over a folder; what it does wrong, the relay in front of it does."""

    user = 'lab'

    def __init__(self, folder):
        self.root = folder
        self.listener, self.port = listen()
        in_background(self.accept)

    def accept(self):
        while True:
            try:
                connection = self.listener.accept()[0]
            except OSError:
                return
            in_background(self.serve, Wire(connection))

    def stop(self):
        self.listener.close()

    def serve(self, wire):
        try:
            self.talk(wire)
        except (OSError, ValueError):
            pass
        wire.close()

    def talk(self, wire):
        here, data = '', None
        wire.tell('220 ready')
        while line := wire.line():
            word, _, name = line.partition(' ')
            word = word.upper()
            path = self.root / here / name.lstrip('/')
            size = path.stat().st_size if path.is_file() else None
            answer = {'USER': '331 password', 'TYPE': '200 ok', 'NOOP': '200 ok', 'PWD': f'257 "/{here}"', 'QUIT': '221 bye',
                      'PASS': '230 in' if name == PASSWORD else '530 not in', 'DELE': '550 no file' if size is None else '250 gone',
                      'SIZE': '550 no file' if size is None else f'213 {size}', 'CWD': '550 no folder',
                      'MKD': '550 there already' if path.exists() else '257 made'}.get(word, '502 not known')
            if word == 'CWD':
                target = name.strip('/') if name.startswith('/') else f'{here}/{name}'.strip('/')
                if (self.root / target).is_dir():
                    here, answer = target, '250 there'
            elif word == 'MKD':
                path.mkdir(exist_ok=True)
            elif word == 'DELE':
                path.unlink(missing_ok=True)
            elif word in ('EPSV', 'PASV'):
                data, port = listen()
                answer = f'229 go on (|||{port}|)' if word == 'EPSV' else f'227 go on (127,0,0,1,{port // 256},{port % 256})'
            elif word in ('STOR', 'LIST', 'RETR'):
                answer = self.transfer(wire, word, path, data)
            wire.tell(answer)

    def transfer(self, wire, word, path, listener):
        if word == 'RETR' and not path.is_file():
            return '550 no file'
        wire.tell('150 now')
        data = listener.accept()[0]
        listener.close()
        try:
            if word == 'STOR':
                with open(path, 'wb', buffering=0) as file:
                    while piece := data.recv(65536):
                        file.write(piece)
            else:
                data.sendall(path.read_bytes() if word == 'RETR' else self.listing(path))
            data.close()
            return '226 done'
        except OSError:
            return '426 cut'

    @staticmethod
    def listing(path):
        folder = path if path.is_dir() else path.parent
        return ''.join(f'{"d" if entry.is_dir() else "-"}rw-r--r-- 1 lab lab {entry.stat().st_size:9} Nov 21 03:47 {entry.name}\r\n'
                       for entry in sorted(folder.iterdir())).encode('latin-1')


# The options of each server, one a word; "," stands for a blank.
VSFTPD = """listen=YES listen_address=127.0.0.1 listen_port={port} background=NO ftp_username=daemon anonymous_enable=YES
no_anon_password=NO secure_email_list_enable=YES email_password_file={scratch}/passwords local_enable=NO delay_failed_login=0
write_enable=YES anon_upload_enable=YES anon_mkdir_write_enable=YES anon_other_write_enable=YES anon_world_readable_only=NO
anon_umask=077 anon_root={root} secure_chroot_dir={scratch}/empty seccomp_sandbox=NO isolate=NO isolate_network=NO"""
PROFTPD = """ServerName,lab ServerType,standalone DefaultAddress,127.0.0.1 SocketBindTight,on Port,{port} UseIPv6,off
UseReverseDNS,off User,daemon Group,daemon PidFile,{scratch}/pid ScoreboardFile,{scratch}/score MaxInstances,30
AuthOrder,mod_auth_file.c AuthUserFile,{scratch}/passwd AuthGroupFile,{scratch}/group RequireValidShell,off DefaultRoot,~
AllowOverwrite,on WtmpLog,off DelayEngine,off SystemLog,{scratch}/log"""
# Encrypted lines alone; the data lines have to be of the login's session where the server can ask for that.
ENCRYPTED = {'vsftpd': """ ssl_enable=YES allow_anon_ssl=YES force_anon_logins_ssl=YES force_anon_data_ssl=YES require_ssl_reuse=YES
rsa_cert_file={tls} rsa_private_key_file={tls} pasv_min_port={first} pasv_max_port={last}""",
             'proftpd': """ ModulePath,{unpacked}/usr/lib/proftpd LoadModule,mod_tls.c TLSEngine,on TLSRequired,on PassivePorts,{first},{last}
TLSRSACertificateFile,{tls} TLSRSACertificateKeyFile,{tls} TLSLog,{scratch}/tls.log""",
             'pure-ftpd': '-Y 3 -2 {tls} -p {first}:{last}'}


class RealFtp:
    """vsftpd, proftpd or pure-ftpd as a Debian package has it, one for each case."""

    def __init__(self, kind, folder, scratch, unpacked, crypt, keeps_bytes, tls=None, ports=(0, 0)):
        """tls: a PEM file with key and certificates; then every line is encrypted, and data lines are on these ports."""
        self.root = folder
        # vsftpd lets users in whom it does not know by this name only, pure-ftpd takes it for nobody's.
        self.user = 'ftp' if kind == 'vsftpd' else 'lab'
        scratch.mkdir()
        (scratch / 'empty').mkdir()
        environment = dict(os.environ, LD_LIBRARY_PATH=f'{unpacked}/usr/lib/x86_64-linux-gnu')
        account = f'lab:{crypt}:1:1::{folder}:/bin/false\n'
        for name, text in (('passwords', PASSWORD + '\n'), ('passwd', account), ('group', 'daemon:x:1:\n')):
            (scratch / name).write_text(text)
            (scratch / name).chmod(0o600)
        # The account's folder is not to be written to, or vsftpd does not run; the one for orders is its user's, daemon.
        folder.chmod(0o755)
        os.chown(folder / ACCOUNT, 1, 1)
        for _ in range(5):
            listener, self.port = listen()
            listener.close()
            names = dict(port=self.port, scratch=scratch, root=folder, tls=tls, unpacked=unpacked, first=ports[0], last=ports[1])
            options = PROFTPD + (' TransferOptions,IgnoreASCII' if keeps_bytes else '') if kind == 'proftpd' else VSFTPD
            options += ENCRYPTED[kind] if tls and kind != 'pure-ftpd' else ''
            configuration = '\n'.join(options.format(**names).split()).replace(',', ' ')
            (scratch / 'conf').write_text(configuration + '\n')
            if kind == 'vsftpd':
                command = ['/usr/sbin/vsftpd', scratch / 'conf']
            elif kind == 'proftpd':
                command = [f'{unpacked}/usr/sbin/proftpd', '-n', '-c', scratch / 'conf']
            else:
                (scratch / 'users').write_text(f'lab:{crypt}:1:1::{folder}/./::::::::::::\n')
                subprocess.run([f'{unpacked}/usr/bin/pure-pw', 'mkdb', scratch / 'users.pdb', '-f', scratch / 'users'],
                               check=True, env=environment)
                command = [f'{unpacked}/usr/sbin/pure-ftpd', '-S', f'127.0.0.1,{self.port}', '-l', f'puredb:{scratch}/users.pdb',
                           '-H', '-u', '1', '-c', '30', '-C', '30', '-g', scratch / 'pid',
                           *(ENCRYPTED[kind].format(**names).split() if tls else ())]
            with open(scratch / 'out', 'wb') as out:
                self.process = subprocess.Popen(command, stdout=out, stderr=out, env=environment, start_new_session=True)
            if self.answers():
                return
        raise RuntimeError(f'{kind} does not start: {(scratch / "out").read_text()}')

    def answers(self):
        for _ in range(200):
            if self.process.poll() is not None:
                return False
            try:
                socket.create_connection(('127.0.0.1', self.port), 1).close()
                return True
            except OSError:
                time.sleep(0.05)
        self.stop()
        return False

    def stop(self):
        # Its sessions may lead groups of their own; they stay in the kernel's session that the server began.
        for status in pathlib.Path('/proc').glob('[0-9]*/stat'):
            try:
                if int(status.read_text().rsplit(')', 1)[1].split()[3]) == self.process.pid:
                    os.kill(int(status.parent.name), 9)
            except (OSError, IndexError):
                pass
        self.process.wait()


class WebLab(socketserver.ThreadingMixIn, http.server.HTTPServer):
    """The lab's web site: takes files, lists them, hears the reports. Faults: route -> Act, see faults.py."""
    daemon_threads = True
    request_queue_size = 64

    def __init__(self, folder, acts, lab):
        self.root, self.acts, self.lab = folder, acts, lab
        self.asked, self.puts, self.confirmed = [], [], set()
        super().__init__(('127.0.0.1', 0), WebSession)
        self.port = self.server_address[1]
        if 'READ' in acts:
            self.socket.setsockopt(socket.SOL_SOCKET, socket.SO_RCVBUF, 8192)
        in_background(self.serve_forever, 0.05)

    def handle_error(self, request, client_address):
        pass

    def stop(self):
        self.shutdown()
        self.server_close()


class WebSession(http.server.BaseHTTPRequestHandler):
    protocol_version = 'HTTP/1.1'
    ROUTES = (('getfile2.php', 'POST'), ('listfileb.php', 'MAKELIST'), ('/uploads/', 'FETCH'), ('padd.asp', 'REPORT'),
              ('p.asp', 'DONE'))

    def log_message(self, *_):
        pass

    def answer(self, body=b'', status=200, length=None, **headers):
        self.status = status
        self.send_response_only(status)
        self.send_header('Content-Length', str(len(body) if length is None else length))
        for name, value in headers.items():
            self.send_header(name, value)
        self.end_headers()
        if self.command != 'HEAD':
            self.wfile.write(body)

    def do_GET(self):
        route = next((route for part, route in self.ROUTES if part in self.path.split('?')[0]), 'OTHER')
        if self.command == 'HEAD' and route == 'FETCH':
            route = 'HEAD'
        self.server.asked.append((route, self.path))
        slow = self.server.acts.get('READ') if route == 'POST' else None
        if slow and slow.due():
            slow.do(self)
        else:
            self.body = self.rfile.read(int(self.headers.get('Content-Length') or 0))
        act = self.server.acts.get(route)
        name = self.sent_file()[0] if route == 'POST' else None
        if name:
            self.server.puts.append((name, name in self.server.confirmed and self.server.lab.is_whole(name)))
        try:
            if not (act and act.due() and act.do(self)):
                self.good(route)
            if name and self.status == 200:
                self.server.confirmed.add(name)
        except OSError:
            self.close_connection = True

    do_POST = do_HEAD = do_GET

    def target(self, name):
        return self.server.root / name

    def query(self, key):
        return urllib.parse.parse_qs(self.path.partition('?')[2], encoding='latin-1').get(key, [''])[0]

    def sent_file(self):
        """Name and bytes of the file of a POST."""
        head, _, rest = self.body.partition(b'\r\n\r\n')
        name = head.split(b'filename="')[1].split(b'"')[0].decode('latin-1')
        return name, rest[:rest.rindex(b'\r\n--OLA_GRAIN')]

    def store(self, change=None):
        name, content = self.sent_file()
        folder = self.target(self.query('folder'))
        folder.mkdir(exist_ok=True)
        if change:
            content = change(content)
        if content is not None:
            (folder / name).write_bytes(content)

    def entries(self):
        """The entries of the order's list: its name, its files, their number."""
        folder = self.target(self.query('tik'))
        if not folder.is_dir():
            return None
        files = sorted(path.name for path in folder.iterdir() if not path.name.startswith('filelist'))
        return [folder.name, *files, f'total:{len(files)}']

    def make_list(self, change=None):
        entries = self.entries()
        if entries is None:
            return self.answer(b'folder not found')
        text = '~~'.join(change(entries) if change else entries).encode('latin-1')
        for name in ('hom', 'hom1', 'hom2', 'hom3', '1'):
            (self.target(self.query('tik')) / f'filelist{name}.txt').write_bytes(text)
        return self.answer(b'ok')

    def good(self, route):
        if route == 'POST':
            self.store()
            self.answer(b'stored\r\n')
        elif route == 'MAKELIST':
            self.make_list()
        elif route in ('FETCH', 'HEAD'):
            path = self.target(urllib.parse.unquote(self.path.partition('/uploads/')[2].partition('?')[0]))
            if path.is_file():
                self.answer(path.read_bytes())
            else:
                self.answer(b'no such file', 404)
        else:
            self.answer(b'OK\r\n', 200 if route != 'OTHER' else 404)
