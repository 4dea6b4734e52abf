"""Says whether the orders of a walk are what its pages showed. It shares no reader with the program and reads the lab's formats by docs/formats.md."""
import copy
import json
import re
import struct
import subprocess
import tempfile
import pathlib
import zlib

SENDING = ('FtpFrm', 'UploadForm')
ARRIVED = ('כל ההזמנה הגיעה', 'The whole order has arrived', 'מה שבהזמנה הגיע', 'What is in the order has arrived',
           'ההזמנה הגיעה, ולא ידוע', 'Your order has arrived')
NOT_TYPED = 'לא הוקלד'
GLOSSY, MATTE = ('מבריק', 'Glossy'), ('מט', 'Matte')
BORDERS = {'ללא מסגרת': 'NB', 'No border': 'NB', 'מסגרת לבנה': 'WB', 'White border': 'WB'}
WITH_MARGINS = 'כל התמונה על הנייר, עם שוליים', 'The whole picture, with margins'
# What an album's bill shows in English, by what the order has.
ALBUM = {'אינדיגו  סבתא': 'Indigo grandma', 'אינדיגו  ספירלה': 'Indigo spiral', 'אינדיגו הורים': 'Indigo parents', 'אינדיגו גדול': 'Indigo large',
         'פוטו הורים': 'Photo parents', 'פוטו גדול': 'Photo large', 'חום': 'Brown', 'קרם': 'Cream', 'מבריק': 'Glossy', 'מט': 'Matte', 'משי': 'Silk',
         'בחר סוג נייר': 'Choose the paper'}
EXTRAS = {'ללא': 'None', 'קנבס': 'Canvas', 'פלטה- סובלימציה': 'Sublimation plate', 'פרספקט': 'Perspex'}
CELLS, CHUNKS, BASE, TAIL = 12, 56, 30, 40
SAMPLE = 3  # prints of an order that are held against the customer's picture, beside those that the editor showed
SIDE, TILE = 150, 8  # pixels: of the small pictures that are compared, and of their tiles
TOLERANCE = 5  # mean difference of preview and print, of 255; it is 1 to 2 where nothing is wrong
TILE_TOLERANCE = 16  # the same of the tile that differs most; it is 13 at most
COARSE = ('1024x768',)  # windows whose editor draws too small a paper for these


def plain(text):
    return re.sub('[\u2066-\u2069\u00a0]', '', text)


def unpacked(data):
    """Picture and tail of a print file."""
    piece = int(data[len(data) - TAIL - 10:len(data) - TAIL]) - BASE
    body = data[:len(data) - TAIL - 10]
    rest = body[CHUNKS * (piece + 2):]
    for i in range(CHUNKS):
        if struct.unpack_from('<H', body, i * (piece + 2) + piece)[0] != i + 1:
            raise ValueError(f'piece {i + 1} has another number')
    whole = b''.join(body[i * (piece + 2):i * (piece + 2) + piece] for i in range(CHUNKS))
    if 2 * len(rest) < CHUNKS:
        whole += rest
    elif 2 * len(rest) > CHUNKS:
        whole = whole[:len(whole) - (CHUNKS - len(rest))]
    else:
        whole = (whole + rest).rstrip(b'\0')
    return whole, data[len(data) - TAIL:]


def pixels(png):
    """Width and rows of RGB of a small picture."""
    at, packed, colours = 8, b'', 3
    while at < len(png):
        length, kind = struct.unpack_from('>I4s', png, at)
        chunk = png[at + 8:at + 8 + length]
        if kind == b'IHDR':
            width, height, _, colour = struct.unpack_from('>IIBB', chunk)
            colours = {0: 1, 2: 3, 6: 4}[colour]
        elif kind == b'IDAT':
            packed += chunk
        at += length + 12
    data, stride, rows, before = zlib.decompress(packed), width * colours, [], bytes(width * colours)
    for y in range(height):
        way, row = data[y * (stride + 1)], bytearray(data[y * (stride + 1) + 1:(y + 1) * (stride + 1)])
        for x in range(stride):
            left, up = row[x - colours] if x >= colours else 0, before[x]
            corner = before[x - colours] if x >= colours else 0
            nearest = min((abs(up - corner), 0, left), (abs(left - corner), 1, up), (abs(left + up - 2 * corner), 2, corner))[2]
            row[x] = (row[x] + (0, left, up, (left + up) // 2, nearest)[way]) & 255
        rows.append([tuple(row[x:x + 3]) if colours > 2 else (row[x],) * 3 for x in range(0, stride, colours)])
        before = row
    return width, rows


def differences(one, other):
    """Of two small pictures of about one size: the mean difference of all pixels, and that of the tile that differs most."""
    width, height = min(one[0], other[0]), min(len(one[1]), len(other[1]))
    tiles = {}
    for y in range(height):
        for x in range(width):
            tile = tiles.setdefault((y // TILE, x // TILE), [0, 0])
            tile[0] += sum(abs(a - b) for a, b in zip(one[1][y][x], other[1][y][x]))
            tile[1] += 3
    return sum(total for total, _ in tiles.values()) / (3 * width * height), max(total / count for total, count in tiles.values())


class Order:
    """What the pages promised of an order: basket, texts and the paper of the editor by the picture's name."""

    def __init__(self):
        self.basket, self.whole, self.total, self.paper, self.choice, self.bill = {}, False, None, '', [], []
        self.details, self.closing, self.previews, self.withAddress, self.album = {}, {}, {}, False, False
        self.before = None  # choice and details, while they are changed from the page of pictures
        self.left = ''      # the latest press on the page of details


class Walk:
    def __init__(self, record, data, lab, tools, size):
        self.record, self.data, self.lab, self.tools = record, data, lab, tools
        self.fine = size not in COARSE
        self.orders = self.prints = self.previews = self.arrived = 0
        self.largest = self.worst = 0  # difference of a print and what was seen, and of a tile of it
        self.found = []
        self.lines = [json.loads(line) for line in (record / 'seen.jsonl').read_text().splitlines()]

    def faults(self):
        order, promise, folder, kept = Order(), None, None, None
        for line in self.lines:
            page, shown = line.get('page'), line.get('shown', {})
            if 'idled' in line:
                order, promise, folder = Order(), None, None
            if 'front' in line:
                if line['front'] == 'nnn' and line['before'] == 'kyoskNew':
                    order.before = order.choice, dict(order.details)
                if line['front'] == 'kyoskNew' and line['before'] == 'nnn' and not order.before:
                    order.basket, order.previews, order.whole = {}, {}, False
                if line['front'] in ('Form2', 'B3') and line['before'] == 'kyoskNew':
                    promise = copy.deepcopy(order.__dict__) | {'leftOut': ''}
                if line['before'] in ('Form2', 'B3') and line['front'] == 'kyoskNew':  # back to the pictures: the order is taken apart
                    promise = None
                if line['front'] in SENDING and line['before'] not in ('Form2', 'B3'):  # an earlier order, checked when it was prepared
                    promise = None
                here = self.record / str(line['n']) / 'orders'
                kept = here if here.is_dir() else kept
                folder = None
            elif page == 'nnn':
                order.details.update({key: text.rstrip() for key, text in shown.items()})  # as the order trims what is typed
                order.left = line['act']
                if 'Text2' in shown:  # the address is asked for only where it is wanted
                    order.details['Text4'] = shown.get('Text4', '')
                if 'Pic4Bil' in shown:
                    order.bill = [row for text in line['words'] for row in plain(text).split('\n')]
                if line['act'] == 'press nnn.Command10':  # what is remembered comes back unseen
                    order.details.pop('Text2', 0), order.details.pop('Text3', 0)
                order.choice = next((plain(text).split(' · ') for text in line['words'] if ' · ' in text), order.choice)
            elif page == 'kyoskNew':
                if order.before and order.left == 'press nnn.Command3':
                    order.previews = {}  # on the paper before
                elif order.before:
                    order.choice, order.details = order.before
                order.before = None
                self.seePictures(order, line)
            elif page == 'tFrmNew' and 'Title' in shown:
                order.previews[plain(shown['Title'])] = self.record / f'preview.{line["n"]}.png'
            if promise:
                promise['leftOut'] += shown.get('List4Hasserot', '')
            notice = shown.get('Notice', '') if page == 'hatchala' else ''
            if page in SENDING or notice:
                name = shown.get('Label46') or shown.get('wholeNumber') or shown.get('Label15') or shown.get('Label16')
                if notice and promise and kept:
                    number = re.search(r'\d+', notice)[0]
                    name = next((path.name for path in kept.iterdir() if path.name.rstrip('P').endswith('^' + number)), None)
                folder = name or folder
                if promise and folder:
                    self.checkOrder(kept / folder, promise)
                    promise = None
                if shown.get('Label4Do', '').startswith(ARRIVED):
                    self.checkArrival(kept, folder)
        if not self.orders:
            self.found.append('no order was checked')
        return self.found

    def seePictures(self, order, line):
        shown, act = line['shown'], line['act']
        for i in range(CELLS):
            if path := shown.get(f'Picture1({i})'):
                copies = int(shown[f'Label4({i})']) if f'Picture4({i})' in shown else 0
                if order.basket.get(path, copies) != copies and sum(shown.get(f'Picture1({j})') == path for j in range(CELLS)) > 1 and \
                        any(shown.get(f'Picture1({j})') == path and (f'Picture4({j})' in shown) != (f'Picture4({i})' in shown) for j in range(CELLS)):
                    self.found.append(f'line {line["n"]}: {path} is chosen in one cell and not in another')
                order.basket[path] = copies
        order.total, order.paper = int(shown.get('Label7', order.total or 0)), shown.get('Label15', order.paper)
        order.album = 'Txt4Ml2' in shown or order.album and 'closingHead' not in shown
        if 'closingHead' in shown:
            order.closing = shown
            order.withAddress = act.endswith('.Command8')
        if act.endswith('.Command24'):
            order.basket, order.whole = {}, True
        if act.endswith('.Command23'):
            order.basket, order.whole = {}, False

    def checkArrival(self, kept, folder):
        self.arrived += 1
        there = [base / folder for base in (self.lab / 'ftp/zalamim234', self.lab / 'uploads') if folder and (base / folder).is_dir()]
        if not there:
            return self.found.append(f'{folder} has arrived, says the page, and the server has no such folder')
        # What is kept of a web server's list, and of broken files, never travels.
        for path in (kept / folder).iterdir():
            if not path.name.startswith(('.', 'filelist', 'kashloo')) and path.suffix in ('.jpp', '.txt', '.prk', '.jpg'):
                if not any((base / path.name).is_file() and (base / path.name).read_bytes() == path.read_bytes() for base in there):
                    self.found.append(f'{folder}/{path.name} has arrived, says the page, and the server has other bytes')

    def checkOrder(self, folder, promise):
        self.orders += 1
        tell = lambda text: self.found.append(f'{folder.name}: {text}')  # noqa: E731

        def same(what, found, wanted):
            if found != wanted:
                tell(f'{what} is {found!r}, and the pages showed {wanted!r}')
        logs = [path for path in folder.glob('*.txt') if path.name != 'kashloo.txt'] if folder.is_dir() else []
        if len(logs) != 1:
            return tell(f'{len(logs)} logs')
        text = logs[0].read_bytes().decode('cp1255', 'replace')
        values = dict(re.findall(r'^"([^"]*)",(.*?)\r?$', text, re.M))
        field = lambda key: values.get(key, values.get('Shemot.' + key, '')).removeprefix('"').removesuffix('"')  # noqa: E731
        edited, album = 'Option' in values, 'GodelLBM' in values
        lines = [part.split('"\r\n"Shoora"')[0].removesuffix('\r\n').removesuffix('"') for part in text.split('"Shoora","')[1:]]
        failed = set(re.findall(r'^"(?:fail_|Failed  )","(.*)"\r?$', text, re.M))
        details, closing = promise['details'], promise['closing']

        # The basket.
        rows = [(line[:9], line[9:209] if edited else '', line[209:] if edited else line[9:]) for line in lines]
        ordered = {path: int(code[:2]) for code, _, path in rows}
        if len(ordered) != len(rows):
            tell('a picture stands in two lines')
        for path, copies in promise['basket'].items():
            if ordered.get(path, 0) != copies:
                tell(f'{path}: {ordered.get(path, 0)} copies, and the page showed {copies}')
        if not promise['whole']:
            for path in ordered.keys() - promise['basket'].keys():
                tell(f'{path} is ordered and was never seen')
        same('the sum of the copies', sum(ordered.values()), promise['total'])
        same('TotalPics', int(field('TotalPics') or -1), promise['total'])

        for path in failed:
            if self.leaf(path) not in plain(promise['leftOut']):
                tell(f'{path} has no print, and no page said so')

        # The texts.
        paper = field('GodelLBM' if album else 'ppr')
        same('the paper', paper, promise['paper'])
        same('the paper at the end', paper, closing.get('Label19', paper))
        same('the copies at the end', closing.get('Label20'), str(promise['total']))
        border = kind = ' '
        if album:
            telephone, name = details.get('Text1(1)', ''), details.get('Text1(0)', '')
            same('the photographer', field('ShemZalam'), name)
            same('the event', field('ShemErooa'), details.get('Text1(2)', ''))
            same('the mail address', field('MailZalam'), closing.get('Txt4Ml2', field('MailZalam')).strip())
            bill = promise['bill']
            for key in ('SoogLBM', 'GodelLBM', 'SoogKricha', 'SoogNiar'):
                if field(key) not in bill and ALBUM.get(field(key)) not in bill:
                    tell(f'{key} is {field(key)!r}, and the bill showed {bill}')
            same('the extra', field('Tosafot1_1'), next((item for item, english in EXTRAS.items() if item in bill or english in bill), ''))
            same('the special extras', [field(f'Tosafot2_{i}')[-2:] for i in range(1, 7)], [row[-2:] for row in bill if re.search('=[01]$', row)])
        else:
            name, telephone = details.get('Text2', field('n1')), details.get('Text3', field('n2'))
            same('the name', field('n1'), name)
            same('the telephone', field('n2'), telephone)
            same('the delivery address', field('n3'), details.get('Text4', field('n3')).strip())
            same('the notes', field('Hearot').rpartition(' - ')[0], closing.get('Text2', ''))
            choice = promise['choice']
            same('the paper of the choice', paper, choice[0])
            kind = 'G' if choice[1] in GLOSSY else 'M' if choice[1] in MATTE else '?'
            bordered = [BORDERS.get(words, words.partition(':')[0].rpartition(' ')[2]) for words in choice[2:] if 'מסגרת' in words or 'order' in words]
            same('fit or fill', field('FillFit'), 'FIT' if choice[-1] in WITH_MARGINS else 'FIL')
            if bordered:
                same('the border', field('Bord'), bordered[0])
            border = field('Bord')[:2]
            typed = closing.get('Text1', '')
            address = typed if '@' in typed else f'{typed}@{closing.get("Combo1", "")}'
            if promise['withAddress'] and typed:
                same('the mail address', field('Mail'), address)
            elif not edited:
                same('the mail address', field('Mail'), NOT_TYPED)
            for code, _, path in rows:
                same(f'the code of {path}', code[2:9].rstrip(), (paper[:2] + paper[-2:] + kind + border).rstrip())

        # The prints.
        kindOfOrder = 2 if edited else int(field('Optint'))
        wanted = {}
        for place, (code, record, path) in enumerate(rows):
            base = path.rpartition('\\')[2][:-4][-20:].encode('cp1255', 'replace').hex().upper()
            if path not in failed:
                wanted[f'{code}{place % 10000:04}_{kindOfOrder:02}{base}.jpp'] = (record, path)
        there = {path.name for path in folder.glob('*.jpp') if not path.name.startswith('!')}
        if there != wanted.keys():
            tell(f'prints {sorted(there - wanted.keys())} too many, {sorted(wanted.keys() - there)} missing')
        digits = telephone if len(telephone) <= 10 else re.sub('[- ]', '', re.sub(r'^\+972-?', '0', telephone))
        tail = ['1 ', '1 ', digits.ljust(10)[:10], name.ljust(10)[:10], field('TotalPics').ljust(3)[:3],
                re.search(r'\^(\d+)', folder.name)[1].ljust(3)[:3], field('ser').ljust(4)[:4], ' ' * 6]
        names = sorted(wanted.keys() & there)
        chosen = [name for name in names if self.leaf(wanted[name][1]) in promise['previews']]
        with tempfile.TemporaryDirectory() as scratch:
            for file in names:
                picture, end = unpacked((folder / file).read_bytes())
                same(f'the tail of {file}', end.decode('cp1255', 'replace'), ''.join(tail))
                record, path = wanted[file]
                if self.isGone(path):
                    continue
                self.prints += 1
                deep = field('More Comp = ') == '1'
                faults = self.comparePrint(pathlib.Path(scratch), picture, path, record, paper, deep, folder.parent.parent / 'corrected')
                seen = promise['previews'].get(self.leaf(path)) if edited else self.source(path)
                if seen and not deep and (self.fine or not edited) and (file in chosen or file in names[:SAMPLE]):
                    self.previews += edited
                    faults += self.compareSeen(pathlib.Path(scratch), picture, seen)
                for fault in faults:
                    tell(f'{file}: {fault}')
        sheets = list(folder.glob('!*'))
        if not sheets or any(not path.read_bytes().startswith(b'\xff\xd8') for path in sheets):
            tell('no order sheet')

    def leaf(self, path):
        return path.rpartition('\\')[2]

    def isGone(self, path):
        """What the door made of a customer's file goes with the order."""
        return path.startswith(r'C:\2000lumora\zmany\door') and not self.source(path).exists()

    def source(self, path):
        return self.data / path[3:].replace('\\', '/')

    def render(self, *arguments):
        done = subprocess.run([self.tools.render, *arguments], capture_output=True, text=True)
        return done.stderr.strip() if done.returncode else ''

    def comparePrint(self, scratch, picture, path, record, paper, deep, corrected):
        source = self.source(path)
        if deep:
            return [] if picture == source.read_bytes() else ['is not the file of the customer']
        red = record[38:41] == 'RED'
        if red:
            source = corrected / path.replace('\\', ']').replace(':', ';')
        mode = ['print', '--record', record, '--frames', self.data / '2000lumora/misgarot'] if record else ['plain']
        if failure := self.render(*mode, '--paper', paper, '--out', scratch, '--', source):
            return [f'lumora-render fails: {failure}']
        return [] if (scratch / (source.stem + '.jpg')).read_bytes() == picture else ['is not what lumora-render makes of it']

    def compareSeen(self, scratch, picture, seen):
        small = scratch / 'small'
        small.mkdir(exist_ok=True)
        (scratch / 'print.jpg').write_bytes(picture)
        (scratch / 'seen.jpg').write_bytes(seen.read_bytes())
        if failure := self.render('small', '--size', str(SIDE), '--out', small, scratch / 'print.jpg', scratch / 'seen.jpg'):
            return [f'lumora-render fails: {failure}']
        one, other = (pixels((small / name).read_bytes()) for name in ('print.png', 'seen.png'))
        if abs(one[0] - other[0]) > 1 or abs(len(one[1]) - len(other[1])) > 1:
            return [f'has another shape than what was seen: {one[0]} x {len(one[1])}, {other[0]} x {len(other[1])}']
        difference, worst = differences(one, other)
        self.largest, self.worst = max(self.largest, difference), max(self.worst, worst)
        return [f'differs by {difference:.1f} from what was seen, and by {worst:.1f} in a tile'] if \
            difference > TOLERANCE or worst > TILE_TOLERANCE else []
