"""The tables of docs/reliability.md: made of the results, and read again as what a program as built in is held to."""
import cases
import kills

MARKS = ('<!-- The table of tests/matrix/run --write begins. -->', '<!-- The table ends. -->')
HEAD = ['| fault | server | built in | careful |', '|---|---|---|---|']
KILLED = ['| order | killed | server | built in | careful |', '|---|---|---|---|---|']
WHERE = {'http': 'HTTP'}
NOT_PLAYED = 'not played'


def cell(case):
    stays = 'LIE' in case.text or cases.SMALL in case.text
    return case.text + (f' ({case.fault.literal})' if stays and case.fault.literal else '')


def lines_of(results, servers):
    """A line for each fault and set of servers that fare alike, and for each way to be killed. servers: all that there are."""
    rows = {}
    told = [case for case in results if case.part != 'kill']
    for part, server, name in dict.fromkeys((case.part, case.server, case.fault.name) for case in told):
        texts = {case.careful: cell(case) for case in told if (case.part, case.server, case.fault.name) == (part, server, name)}
        rows.setdefault((part, name, texts.get(False, NOT_PLAYED), texts.get(True, NOT_PLAYED)), []).append(server)
    lines = []
    for (part, name, off, on), there in rows.items():
        where = WHERE.get(part) or ('all' if set(there) == set(servers) else ', '.join(there))
        lines.append(f'| {name} | {where} | {off} | {on} |')
    return lines + kill_lines([case for case in results if case.part == 'kill'])


def kill_lines(results):
    """How often each end came; those that must not be are named."""
    def ends(chosen):
        counts = {}
        for case in chosen:
            counts.setdefault((case.text, case.good), []).append(case.place)
        return ', '.join(f'{text} {len(places)}' + ('' if good else f' ({", ".join(places)})')
                         for (text, good), places in counts.items()) or NOT_PLAYED

    def kind(case):
        return kills.ORDERS[case.order_of, case.way], f'{case.point} {"a rename" if case.environment else "a file"}', case.server

    def cells(name):
        return [ends([case for case in results if kind(case) == name and case.careful == careful]) for careful in (False, True)]

    return ['| ' + ' | '.join([*name, *cells(name)]) + ' |' for name in dict.fromkeys(map(kind, results))]


def way_of(line):
    """The way that a line of the document tells of."""
    if line[:1] != '|':
        return 'run' if line[:1] == '`' else 'load'
    if line.count('|') == KILLED[0].count('|'):
        return 'kill'
    return 'pair' if any(', ' + order in line for order in kills.ORDERS.values()) else 'http' if '| HTTP |' in line else 'ftp'


def document(lines):
    """The lines in their tables, the others behind them."""
    chosen = {way: [line for line in lines if way_of(line) == way] for way in ('ftp', 'http', 'pair', 'kill', 'load', 'run')}
    tables = (HEAD, chosen['ftp'] + chosen['http'] + chosen['pair']), (KILLED, chosen['kill'])
    return '\n\n'.join(['\n'.join(head + rows) for head, rows in tables if rows] + chosen['load'] + chosen['run'])


def stated(path, servers):
    """(fault, server) -> what the table has of the program as built in."""
    found = {}
    for line in path.read_text().split(MARKS[0])[1].split(MARKS[1])[0].splitlines():
        cells = [part.strip() for part in line.strip('|').split('|')]
        if len(cells) == 4:
            for server in servers if cells[1] == 'all' else cells[1].split(', '):
                found[cells[0], server] = cells[2]
    return found


def differs(case, found):
    """True for a case as built in whose end is not the one of the table. found: None where the table is made anew."""
    if found is None or case.careful or case.part == 'kill':
        return False
    return found.get((case.fault.name, WHERE.get(case.part, case.server))) not in (NOT_PLAYED, cell(case))


def is_worse(case, found):
    """The same for a kept session, which the tables don't have: it asks for less, so that a fault may strike it later or not at all."""
    stated = (found or {}).get((case.fault.name, WHERE.get(case.part, case.server)), '')
    return differs(case, found) and (case.never_came() or any(
        mark in case.text and mark not in stated for mark in ('LIE', 'STILL', 'EARLY', 'twice', 'overwritten', 'report', 'resend told')))


def write(path, lines, ways):
    """Puts the lines in place of those of the same ways, and of a run with the same arguments."""
    before, rest = path.read_text().split(MARKS[0])
    old, after = rest.split(MARKS[1])
    runs = {line.split(': ')[0] for line in lines if way_of(line) == 'run'}
    stay = [line for line in old.splitlines()
            if line and line not in HEAD + KILLED and way_of(line) not in ways and line.split(': ')[0] not in runs]
    path.write_text(before + MARKS[0] + '\n\n' + document(stay + lines) + '\n\n' + MARKS[1] + after)
