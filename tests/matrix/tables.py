"""The tables of docs/reliability.md: made of the results, and read again as what a program as built in is held to."""
import cases
import kills

MARKS = ('<!-- The table of tests/matrix/run --write begins. -->', '<!-- The table ends. -->')
HEAD = ['| fault | server | built in | careful |', '|---|---|---|---|']
WHERE = {'http': 'HTTP'}


def cell(case):
    stays = 'LIE' in case.text or cases.SMALL in case.text
    return case.text + (f' ({case.fault.literal})' if stays and case.fault.literal else '')


def table(results):
    """A row for each fault and set of servers that fare alike."""
    rows = {}
    told = [case for case in results if case.part != 'kill']
    for part, server, name in dict.fromkeys((case.part, case.server, case.fault.name) for case in told):
        texts = {case.careful: cell(case) for case in told if (case.part, case.server, case.fault.name) == (part, server, name)}
        rows.setdefault((part, name, texts.get(False, ''), texts.get(True, '')), []).append(server)
    lines = HEAD[:]
    for (part, name, off, on), there in rows.items():
        where = WHERE.get(part) or ('all' if len(there) == 4 else ', '.join(there))
        lines.append(f'| {name} | {where} | {off} | {on} |')
    return '\n'.join(lines + kill_table([case for case in results if case.part == 'kill']))


def kill_table(results):
    """How often each end came; those that must not be are named."""
    def ends(chosen):
        counts = {}
        for case in chosen:
            counts.setdefault((case.text, case.good), []).append(case.place)
        return ', '.join(f'{text} {len(places)}' + ('' if good else f' ({", ".join(places)})') for (text, good), places in counts.items())

    def kind(case):
        return kills.ORDERS[case.order_of, case.way], f'{case.point} {"a rename" if case.environment else "a file"}', case.server

    lines = ['', '| order | killed | server | built in | careful |', '|---|---|---|---|---|']
    for name in dict.fromkeys(map(kind, results)):
        cells = [ends([case for case in results if kind(case) == name and case.careful == careful]) for careful in (False, True)]
        lines.append('| ' + ' | '.join([*name, *cells]) + ' |')
    return lines if results else []


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
    """True for a case whose end is another one than the table has."""
    where = WHERE.get(case.part, case.server)
    return not case.careful and found.get((case.fault.name, where), cell(case)) not in ('', cell(case))


def write(path, text):
    before, after = path.read_text().split(MARKS[0])[0], path.read_text().split(MARKS[1])[1]
    path.write_text(before + MARKS[0] + '\n\n' + text + '\n\n' + MARKS[1] + after)
