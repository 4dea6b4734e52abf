"""The faults, a row each: name, what happens at which command, and what else the runner must know of it.

FTP: command -> (what is done, how often, from which coming on), see relay.py. HTTP: route -> the same, see servers.py."""
import re
import time

from relay import ALWAYS, Act, drop

STRAY = 'Thumbs.db'


class Fault:
    def __init__(self, name, acts=None, **more):
        self.name = name
        self.acts = {word: act if isinstance(act, tuple) else (act,) for word, act in (acts or {}).items()}
        self.host = more.pop('host', 'relay')   # or closed, blackhole, ipv6: what stands in the lab's file
        self.clock = more.pop('clock', 10)      # how many times as fast the program's clock runs
        self.limit = more.pop('limit', 150)      # seconds here until the program counts as hanging
        self.only = more.pop('only', ())        # the servers that it is played before; none: all
        self.again = more.pop('again', 0)       # files that may be sent twice, since the server's answers call for it
        self.literal = more.pop('literal', '')  # why a lie stays even with Careful
        self.quick = more.pop('quick', False)   # also with .ci/run's tests
        self.as_installed = more.pop('as_installed', False)  # the server changes files under TYPE A, and the lab has not set I
        self.heals = more.pop('heals', True)    # the server is good when the order is sent again
        self.plays = more.pop('plays', None)    # what the case plays in place of a sending and a resend
        assert not more, more


# --- what can be done at a command

def reply(text):
    return lambda session, line: session.tell(text) or True


def bye(text):
    def act(session, line):
        session.tell(text)
        session.close()
        raise OSError
    return act


def cut(session, line):
    session.cut()


def hang(session, line):
    session.wait_for_the_end()


def late(seconds):
    return lambda session, line: time.sleep(seconds)


def passed(**options):
    return lambda session, line: session.forward(line, **options)


def closing(text):
    return passed(answer=lambda given: text)


def hang_before_the_end(session, line):
    return session.forward(line, answer=lambda given: session.wait_for_the_end())


def half(content):
    return content[:len(content) // 2]


def then_gone(text=None):
    """Stored, taken away again, and answered so."""
    def act(session, line):
        def answer(given):
            session.server.tell('DELE' + line[4:])
            session.server.reply()
            return text or given
        return session.forward(line, answer=answer)
    return act


def stored_as(rename):
    return lambda session, line: session.forward(line[:5] + rename(line[5:]))


def refuse_second(session, line):
    if len(session.relay.open) > 1:
        session.tell('421 one connection for each address')
        session.close()
        return True
    return False


def forward_and_close(session, line):
    session.forward(line)
    session.close()
    raise OSError


def empty_is(text):
    def act(session, line):
        seen = []
        return session.forward(line, change=lambda content: seen.append(content) or content,
                               answer=lambda given: text if not seen[0].strip() else given)
    return act


def at_each(act, words='GREETING USER PASS PWD TYPE EPSV CWD MKD DELE SIZE STOR LIST'):
    return {word: act for word in words.split()}


def many_lines(text):
    code = text[:3]
    return f'{code}-one\n999 two\n {code} is no end\n{code}-three\n{text}' if text else text


def without_parentheses(text):
    return re.sub(r'\(([\d,]+)\)', r'\1', text)


def no_epsv(pasv=None, text='500 unknown'):
    return {'EPSV': reply(text), **({'PASV': pasv} if pasv else {})}


def foreign_order(session, line):
    session.relay.lab.put_foreign_order()


def put_stray(session, line):
    session.relay.lab.put_stray()


LINE = re.compile(rb'^([d-])\S*\s+\S+\s+\S+\s+\S+\s+(\d+) (\w+) +(\d+) +(\S+) (.*?)\r?$', re.M)


def lines_as(form):
    """A listing whose lines are written anew: form(kind, size, month, day, time, name)."""
    def change(content):
        return b''.join(form(*match.groups()) + b'\r\n' for match in LINE.finditer(content) if match[6] not in (b'.', b'..'))
    return passed(change=change)


LISTINGS = {
    'ISO dates': lambda k, s, m, d, t, n: k + b'rw-r--r-- 1 lab lab ' + s + b' 2026-11-22 01:02 ' + n,
    'months of another language': lambda k, s, m, d, t, n: k + b'rw-r--r-- 1 lab lab ' + s + b' nov. 22 01:02 ' + n,
    'bare names': lambda k, s, m, d, t, n: n,
    'DOS': lambda k, s, m, d, t, n: b'11-22-26  01:02AM ' + (b'      <DIR>          ' if k == b'd' else s.rjust(20) + b' ') + n,
    'an ACL sign and a year': lambda k, s, m, d, t, n: k + b'rw-r--r--+ 1 lab lab ' + s + b' Nov 22  2026 ' + n,
    'no group': lambda k, s, m, d, t, n: k + b'rw-r--r-- 1 lab ' + s + b' Nov 22 01:02 ' + n,
    'NetWare': lambda k, s, m, d, t, n: k + b' [R----F--] lab ' + s.rjust(12) + b' Nov 22 01:02 ' + n,
    'EPLF': lambda k, s, m, d, t, n: b'+' + (b'/' if k == b'd' else b'r,s' + s) + b',\t' + n,
    'facts as of MLSD': lambda k, s, m, d, t, n: b'type=' + (b'dir' if k == b'd' else b'file;size=' + s) + b'; ' + n,
}

def without_state(case):
    """The order's hidden state is lost before the order is sent again."""
    case.result = case.verdict(case.play('plain', 'ftp'))
    (case.mine.order() / '.order').unlink()
    del case.relay.acts['STOR']
    case.result += ', by resend ' + case.send_again('again')


def fewer_pictures(case):
    """The customer agrees to send fewer pictures than the log names, and the lab wants no reports."""
    case.switches = 'Reports = no\n'
    case.play('plain', 'prepared')
    next(case.mine.order().glob('*.jpp')).unlink()
    case.result = case.send_again('agreed', 'goon')
    case.result += ', then ' + case.send_again('goon')


def print_cut_here(case):
    """A print is cut on this machine behind the preparation, and the customer agrees to send the order all the same."""
    case.switches = 'Reports = no\n'
    case.play('plain', 'prepared')
    cut = next(path for path in case.mine.order().glob('*.jpp') if path.name[0] != '!')
    cut.write_bytes(cut.read_bytes()[:1000])
    case.mine.damaged.add(cut.name)
    case.result = case.send_again('agreed', 'goon')


def state_not_kept(prepared):
    def plays(case):
        """The disk has no room for the order's state while it is sent, then it has."""
        case.play(case.order_of, prepared)
        ended = case.play('goon', case.way, MATRIX_FULL='/.order')
        arrived = ended and case.mine.told() == 'arrived'
        case.result = case.verdict(ended)
        case.found = case.beside(1 if arrived else 0)
        if not arrived:
            case.result += ', then ' + case.send_again('goon')
    return plays


def three_wait(case):
    """Three orders whose server is down; it comes back, and the program that sends them by itself is killed in a file of the second."""
    case.switches = '[Kiosk]\nWaiting = yes\n[Switches]\n'
    told = [case.play(case.order_of, case.way) and 'you need not wait' in case.mine.said for _ in range(3)]
    if case.way == 'ftp':
        case.acts['STOR'] = Act(lambda session, line: session.forward(
            line, change=lambda content: case.mine.kill() or content[:len(content) // 2]), 1, IN_THE_SECOND)
    else:
        case.acts['POST'] = Act(stored_and_cut(half, kills=True), 1, IN_THE_SECOND_BY_HTTP)
    case.play('waiting', healed=True)
    killed = case.mine.status == -9
    case.heal()
    case.play('waiting', healed=True)
    here = [(order.name, name, content) for order in case.mine.orders() for name, content in case.mine.files(order).items() if name != '000.jpg']
    there = all((case.arrived / order / name).is_file() and (case.arrived / order / name).read_bytes() == content for order, name, content in here)
    case.result = 'arrived whole' if len(here) == 15 and there else 'LIE: files missing or damaged'
    twice = sum(already for _, already in (case.relay or case.web).puts)
    case.found = [text for text, is_so in (('the customer is not told', not all(told)), ('not killed', not killed), ('still waiting', case.mine.status != 0),
                                           (f'{twice} sent twice', twice > 0)) if is_so] + case.wrong_reports(3)


IN_THE_SECOND, IN_THE_SECOND_BY_HTTP = 9, 7    # of the puts; an order has six, by HTTP five

# The third put is a print. Of a pair the first number is that with a session for each file, the second that with a session kept.
PRINT = 3
# A listing of the order's folder with all its files. Before it a kept session lists where it is careful, under type A twice.
MIDDLE = (12, lambda case: 1 + case.careful + (case.careful and not case.takes_type_i()))

FTP = [
    Fault('no fault', quick=True),
    Fault('as installed, under TYPE A', only=('pure-ftpd', 'proftpd'), as_installed=True, heals=False),
    # the way to the server
    Fault('nobody listens', host='closed', only=('scripted',)),
    Fault('nobody listens to three orders, then killed', host='closed', only=('scripted',), plays=three_wait, quick=True),
    Fault('a black hole', host='blackhole', only=('scripted',), clock=60),
    Fault('IPv6 only', host='ipv6'),
    Fault('connects and stays silent', {'CONNECT': hang}, clock=120, only=('scripted',)),
    Fault('connects and stays silent, twice', {'CONNECT': (hang, 2, (3, 1))}, clock=20),
    Fault('two files wait in vain, then not', {'CONNECT': (hang, 10)}, clock=60),
    Fault('too many clients, twice', {'CONNECT': (bye('421 Too many connections'), 2, (2, 1))}, quick=True),
    Fault('too many clients, always', {'CONNECT': bye('421 Too many connections')}),
    Fault('one connection for each address', {'CONNECT': refuse_second}),
    Fault('login refused', {'PASS': reply('530 Login incorrect')}),
    Fault('login refused, then not', {'PASS': (reply('530 Login incorrect'), 3, (4, 1))}, quick=True),
    Fault('wants encryption', {'USER': reply('550 SSL/TLS required on the control channel')}),
    Fault('greeting of several lines', {'GREETING': passed(answer=many_lines)}),
    Fault('replies of several lines', at_each(passed(answer=many_lines), 'GREETING USER PASS PWD TYPE CWD MKD DELE SIZE STOR LIST'),
          quick=True),
    Fault('half a second a command', at_each(late(0.05)), limit=120),
    Fault('reset at QUIT', {'QUIT': cut}),
    Fault('closes after each listing', {'LIST': forward_and_close}),
    # the way to the folder
    Fault('login folder /home/lab', {'PWD': passed(answer=lambda text: text.replace('"/', '"/home/lab/', 1))}),
    Fault('no folder can be made', {'MKD': reply('550 Create directory operation failed')}),
    Fault('a folder is made at the second time', {'MKD': (reply('550 Create directory operation failed'), 1)}),
    Fault('the folder cannot be entered, once', {'CWD': (reply('550 Failed to change directory'), 1, (4, 3))}),
    Fault('another order in the folder', {'CONNECT': (foreign_order, 1)}, only=('scripted',), quick=True),
    Fault('another order comes after the listing', {'MKD': (foreign_order, 1)}, only=('scripted',)),
    Fault('a stray file in the folder', {'STOR': (put_stray, 1, 2)}, quick=True),
    # the data line
    Fault('no EPSV', no_epsv(), quick=True),
    Fault('no EPSV, PASV with a foreign address',
          no_epsv(passed(answer=lambda text: text.replace('127,0,0,1', '192,0,2,7')), '522 not for this network')),
    Fault('no EPSV, PASV without parentheses', no_epsv(passed(answer=without_parentheses))),
    Fault('no passive', no_epsv(reply('550 Permission denied'))),
    Fault('30 kB/s', {'STOR': passed(rate=300_000)}, limit=120),
    # As built in each put waits for its end: up to two minutes on a busy machine.
    Fault('0.3 kB/s for ever', {'STOR': passed(rate=20_000)}, clock=60, limit=400, only=('scripted',)),
    # a put that is refused
    Fault('STOR refused, once', {'STOR': (reply('550 Permission denied'), 1, PRINT)}),
    Fault('STOR refused, always', {'STOR': (reply('553 Could not create file'), ALWAYS, PRINT)}),
    Fault('STOR answered 421, once', {'STOR': (bye('421 Timeout'), 1, PRINT)}),
    Fault('control line cut at STOR', {'STOR': (cut, 1, PRINT)}),
    # a put that is cut
    Fault('data line cut, once', {'STOR': (passed(cut=20_000), 1, PRINT)}, quick=True),
    Fault('data line cut, four times', {'STOR': (passed(cut=20_000), 4, PRINT)}),
    Fault('data line cut, always', {'STOR': (passed(cut=20_000), ALWAYS, PRINT)}),
    Fault('data line cut, and 226', {'STOR': (passed(cut=20_000, reset_server=False, answer=lambda text: '226 done'), 1, PRINT)}),
    Fault('data and control line cut', {'STOR': (passed(cut=20_000, answer=lambda text: ''), 1, PRINT)}),
    Fault('data line cut, DELE refused',
          {'STOR': (passed(cut=20_000), 1, PRINT), 'DELE': reply('550 Permission denied')}),
    Fault('226 lost, once', {'STOR': (closing(''), 1, PRINT)}, quick=True),
    Fault('226 lost, always', {'STOR': (closing(''), ALWAYS, PRINT)}),
    Fault('silence after 150', {'STOR': (passed(stall=0), 1, PRINT)}, clock=20),
    Fault('silence in mid-file', {'STOR': (passed(stall=20_000), 1, PRINT)}, clock=20),
    Fault('silence before 226', {'STOR': (hang_before_the_end, 1, PRINT)}, clock=20),
    # a full server
    Fault('disk full from the third file on', {'STOR': (passed(cut=20_000, answer=lambda text: '452 No space'), ALWAYS, PRINT)}),
    Fault('451 after the data, once', {'STOR': (closing('451 Failure writing to local file'), 1, PRINT)}),
    Fault('552 after the data, the file gone', {'STOR': (then_gone('552 Quota exceeded'), ALWAYS, PRINT)}),
    Fault('552 after the data, the file gone, once', {'STOR': (then_gone('552 Quota exceeded'), 1, PRINT)}),
    # a put that is answered well
    Fault('226, the file is empty', {'STOR': (passed(change=lambda content: b''), 1, PRINT)}),
    Fault('226, the file is half', {'STOR': (passed(change=half), 1, PRINT)}, quick=True),
    Fault('226, the file is half, always', {'STOR': (passed(change=half), ALWAYS, PRINT)}, literal='it is proven by its name'),
    Fault('226, the last byte is missing', {'STOR': (passed(change=lambda content: content[:-1]), 1, PRINT)}),
    Fault('226, the file is half, SIZE refused',
          {'STOR': (passed(change=half), 1, PRINT), 'SIZE': reply('550 SIZE not allowed in ASCII mode')}),
    Fault('226, the file is half, SIZE refused, bare names',
          {'STOR': (passed(change=half), 1, PRINT), 'SIZE': reply('500 unknown'), 'LIST': lines_as(LISTINGS['bare names'])},
          literal='no length is to be had'),
    Fault('226, the file is half, SIZE answered 451 three times, bare names',
          {'STOR': (passed(change=half), 1, PRINT), 'SIZE': (reply('451 Try again'), 3), 'LIST': lines_as(LISTINGS['bare names'])}),
    Fault('SIZE tells other than the listing', {'SIZE': reply('213 5')}),
    Fault('226, the file is gone', {'STOR': (then_gone(), 1, PRINT)}),
    Fault('226, the file is gone, and a stray one there',
          {'STOR': (then_gone(), 1, PRINT), 'EPSV': (put_stray, 1, (10, 5))}),
    Fault('CR dropped', {'STOR': passed(change=lambda content: content.replace(b'\r', b''))}, heals=False, quick=True),
    Fault('CRLF to LF', {'STOR': passed(change=lambda content: content.replace(b'\r\n', b'\n'))}, heals=False),
    Fault('LF to CRLF', {'STOR': passed(change=lambda content: content.replace(b'\n', b'\r\n'))}, heals=False),
    Fault('names in small letters', {'STOR': stored_as(str.lower)}, heals=False),
    Fault('"^" stored as "_"', {'STOR': stored_as(lambda name: name.replace('^', '_'))}, heals=False),
    # listings
    Fault('listing cut in half, once', {'LIST': (passed(change=half), 1, MIDDLE)}, quick=True),
    Fault('listing empty, once', {'LIST': (passed(change=lambda content: b''), 1, MIDDLE)}),
    Fault('listing reset, once', {'LIST': (passed(cut=40), 1, MIDDLE)}),
    Fault('listing refused, once', {'LIST': (reply('425 Failed to establish connection'), 1, MIDDLE)}),
    Fault('listing refused from the middle on', {'LIST': (reply('550 no'), ALWAYS, MIDDLE)}),
    Fault('listing of the new folder refused, once', {'LIST': (reply('425 Failed to establish connection'), 1, (3, 1))}),
    Fault('listing silent, once', {'LIST': (hang, 1, MIDDLE)}, clock=20),
    Fault('450 for an empty folder', {'LIST': empty_is('450 No files found')}),
    Fault('550 for an empty folder', {'LIST': empty_is('550 No files found')}),
    Fault('10 s after each listing whose data line stays open', {'LIST': passed(linger=1)}, limit=120),
    Fault('"." and ".." in the listing',
          {'LIST': passed(change=lambda content: b'drwxr-xr-x 2 lab lab 0 Nov 22 01:02 .\r\ndrwxr-xr-x 2 lab lab 0 Nov 22 01:02 ..\r\n'
                          + content)}),
    *[Fault(f'listing: {name}', {'LIST': lines_as(form)}) for name, form in LISTINGS.items()],
    Fault('sent again without its state, its log withheld at first', plays=without_state, only=('scripted',), acts={
        'STOR': (reply('553 Could not create file'), ALWAYS, PRINT), 'RETR': (reply('425 Failed to establish connection'), 1)}),
    Fault('fewer pictures as agreed, no reports', plays=fewer_pictures, only=('scripted',)),
    Fault('a print is cut here behind the preparation, as agreed', plays=print_cut_here, only=('scripted',), heals=False),
    Fault('no room for the state while the order is sent', plays=state_not_kept('prepared'), only=('scripted',), quick=True),
]


# --- the same for the web

def stored(change=None, body=b'stored\r\n', status=200):
    def act(session):
        session.store(change)
        session.answer(body, status)
        return True
    return act


def says(body=b'', status=200, **more):
    return lambda session: session.answer(body, status, **more) or True


def drops(session):
    drop(session.connection)
    raise OSError


def silent(session):
    time.sleep(30)
    raise OSError


def stored_and_cut(change=None, kills=False):
    def act(session):
        session.store(change)
        if kills:
            session.server.lab.mine.kill()
        drops(session)
    return act


def lists(change):
    return lambda session: session.make_list(change) or True


def redirects(status):
    return lambda session: session.answer(b'', status, Location=session.path + '&again=1') or True \
        if 'again=1' not in session.path and '?' in session.path else False


def without_end(session):
    session.send_response_only(200)
    session.end_headers()
    try:
        for _ in range(3000):
            session.wfile.write(b'~~' * 8192)
    finally:
        session.close_connection = True


def foreign_folder(session):
    session.server.lab.put_foreign_order()


def of_list(add):
    """An answer with the list's own text and a false length."""
    def act(session):
        path = session.server.root / session.path.partition('/uploads/')[2]
        session.close_connection = True
        if path.is_file():
            session.answer(path.read_bytes(), length=path.stat().st_size + add)
        return path.is_file()
    return act


def slowly(rate):
    """A server that takes so many bytes of a file a second."""
    def act(session):
        left = int(session.headers['Content-Length'])
        session.body = b''
        while left and (piece := session.rfile.read1(min(left, max(rate // 10, 1)))):
            session.body += piece
            left -= len(piece)
            time.sleep(len(piece) / rate)
    return act


def stray_file(session):
    session.server.lab.put_stray()


def other_length(session):
    path = session.server.root / session.path.partition('/uploads/')[2].replace('%20', ' ')
    return session.answer(b'', length=path.stat().st_size + 7) or True if path.is_file() else False


def other_log(case):
    """Another customer's log takes the place of the order's before the order goes on."""
    case.play('edited', 'http')
    log = case.arrived / case.mine.order().name / (case.mine.order().name + '.txt')
    log.write_bytes(log.read_bytes().replace(b'Dana', b'Noam'))
    case.foreign = {log: log.read_bytes()}
    case.heal()
    case.result = case.send_again('goon')
    if case.mine.told() == 'not' and 'call the lab' not in case.mine.said:
        case.found.append('the customer is not to call the lab')


# The first list is asked for before anything is sent. Without any list that can be read the next attempt posts all again.
FIRST = 2
HTTP = [
    Fault('no fault', quick=True),
    Fault('nobody listens', host='closed'),
    Fault('nobody listens to three orders, then killed', host='closed', plays=three_wait, quick=True),
    Fault('a black hole', host='blackhole', clock=60),
    Fault('half of a file stored, once', {'POST': (stored(half), 1, 2)}, quick=True),
    Fault('half of a file stored, always', {'POST': (stored(half), ALWAYS, 2)}),
    Fault('an empty file stored', {'POST': (stored(lambda content: b''), 1, 2)}),
    Fault('200, nothing stored, once', {'POST': (says(b'Warning: POST Content-Length exceeds the limit'), 1, 2)}),
    Fault('200, four files not stored', {'POST': (says(b'error=7'), 4)}, quick=True),
    Fault('200, nothing is ever stored', {'POST': says(b'error=7')}),
    Fault('413', {'POST': (says(b'too large', 413), ALWAYS, 2)}),
    Fault('500, once', {'POST': (says(b'', 500), 1, 2)}),
    Fault('500, always', {'POST': says(b'', 500)}),
    Fault('500, half of a file stored, once, and no HEAD', {'HEAD': says(b'', 405), 'POST': (stored(half, status=500), 1, 2)}),
    Fault('POST: silence, once', {'POST': (silent, 1, 2)}, clock=20, limit=120),
    Fault('POST: silence, always', {'POST': silent}, clock=60),
    Fault('POST: 0.3 kB/s for ever', {'READ': slowly(20_000)}, clock=60),
    Fault('POST: half stored, line cut, once', {'POST': (stored_and_cut(half), 1, 2)}),
    Fault('POST: half stored, line cut, once, and no HEAD', {'POST': (stored_and_cut(half), 1, 2), 'HEAD': says(b'', 405)}),
    Fault('POST: an answer shorter than it says, once', {'POST': (lambda session: session.store() or session.answer(b'sto', length=90)
                                                                  or drops(session), 1, 2)}),
    Fault('POST: line cut, once', {'POST': (drops, 1, 2)}, quick=True),
    Fault('POST: stored, line cut, once', {'POST': (stored_and_cut(), 1, 2)}),
    Fault('POST: redirect 302', {'POST': redirects(302)}),
    Fault('POST: redirect 307', {'POST': redirects(307)}),
    Fault('list script: 500, once', {'MAKELIST': (says(b'', 500), 1, FIRST)}),
    Fault('list script: 500, always', {'MAKELIST': (says(b'', 500), ALWAYS, FIRST)}, again=10),
    Fault('list script: silence, once', {'MAKELIST': (silent, 1, FIRST)}, clock=20, limit=120),
    Fault('list script: redirect', {'MAKELIST': redirects(302)}),
    Fault('list with ".", a file not stored',
          {'MAKELIST': lists(lambda entries: [*entries[:-1], '.', entries[-1]]), 'POST': (says(b'error=7'), ALWAYS, 5)}),
    Fault('list with parts of names, files not stored',
          {'MAKELIST': lists(lambda entries: [*entries[:-1], 'jpp', 'jpp', 'txt', entries[-1]]), 'POST': (says(b'error=7'), ALWAYS, 3)}),
    Fault('list with names in capitals', {'MAKELIST': lists(lambda entries: [*entries[:1], *map(str.upper, entries[1:-1]), entries[-1]])}),
    Fault('list without total', {'MAKELIST': (lists(lambda entries: entries[:-1]), 1, FIRST)}),
    Fault('list that begins with a byte order mark', {'MAKELIST': lists(lambda entries: ['ï»¿' + entries[0], *entries[1:]])}),
    Fault('list without the folder', {'MAKELIST': (lists(lambda entries: entries[1:]), 1, FIRST)}),
    Fault('list lacks a file, once', {'MAKELIST': (lists(lambda entries: [*entries[:2], *entries[3:]]), 1, FIRST)}, again=1),
    Fault('list: redirect', {'FETCH': lambda session: session.answer(b'', 302, Location=session.path + '?again') or True
                             if '?' not in session.path else False}),
    Fault('list: 404, once', {'FETCH': (says(b'no such file', 404), 1, 4)}),
    Fault('list: 404, always', {'FETCH': says(b'no such file', 404)}, again=10),
    Fault('list: a page of words, 200', {'FETCH': (says(b'<html>This site is being worked on. Please come back.</html>'), 2, 3)}),
    Fault('list without end', {'FETCH': (without_end, 2, 3)}, limit=120),
    Fault('list: Content-Length too large', {'FETCH': (of_list(add=100), 2, 3)}, quick=True),
    Fault('list: Content-Length too small', {'FETCH': (of_list(add=-60), 2, 3)}),
    Fault('no HEAD', {'HEAD': says(b'', 405)}),
    Fault('HEAD: 404', {'HEAD': says(b'', 404)}),
    Fault('HEAD: 503 three times, half of a print stored', {'HEAD': (says(b'', 503), 3), 'POST': (stored(half), 1, 3)}, again=4),
    Fault('HEAD: line cut, once', {'HEAD': (drops, 1, 2)}, again=1),
    Fault('HEAD: silence', {'HEAD': silent}, clock=60, again=10),
    Fault('HEAD tells another length, once', {'HEAD': (other_length, 1, 2)}, again=1),
    Fault('HEAD tells another length, always', {'HEAD': other_length}, again=10),
    Fault('a stray file in the folder', {'POST': (stray_file, 1, 2)}, quick=True),
    Fault('no HEAD, half of a file stored', {'HEAD': says(b'', 405), 'POST': (stored(half), 1, 2)}, literal='no length is to be had'),
    Fault('another order in the folder', {'MAKELIST': (foreign_folder, 1)}, quick=True),
    Fault("killed behind the last file, another order's log there", {'POST': (stored_and_cut(kills=True), 1, 5)}, plays=other_log),
    Fault('no room for the state while the order is sent', plays=state_not_kept('prepared-web')),
    Fault('report: 500', {'REPORT': says(b'', 500), 'DONE': says(b'', 500)}),
    Fault('report: silence', {'REPORT': silent, 'DONE': silent}, clock=60, limit=120),
    Fault('report: line cut', {'REPORT': drops, 'DONE': drops}),
]
