"""The faults of ./run, by file. In a copy of the tree each becomes a choice at run time: an expression "old" becomes a conditional one, a statement
(it ends in ";") an if; where neither fits, "new" says MUTATED itself.

Rows are written from the code alone, without a look at the tests; those with seen=True were found missing by hand once, and tests were then
written for them. A survivor that is known and does no harm has a word why in told.
"""
import collections

F = collections.namedtuple('F', 'old new harm seen told', defaults=(False, ''))

# What a floor's faults are played against: the tests of the floor, then further ones, the quick ones first.
SUITES = {
    'common': ('common', 'order', 'session', 'platform', 'finished', 'assembly', 'torture', 'scenarios'),
    'door': ('door', 'selection', 'torture'), 'imaging': ('imaging', 'assembly', 'editing', 'scenarios'),
    'platform': ('platform', 'internet', 'session', 'order', 'finished', 'integration_mail', 'transfer', 'scenarios'),
    'session': ('session', 'start', 'entry', 'selection', 'finished', 'assembly', 'scenarios', 'views'),
    'order': ('order', 'start', 'entry', 'selection', 'finished', 'assembly', 'editing', 'transfer', 'scenarios'),
    'editing': ('editing', 'selection', 'assembly', 'scenarios', 'views'), 'selection': ('selection', 'scenarios', 'views'),
    'assembly': ('assembly', 'torture', 'scenarios'), 'transfer': ('transfer', 'internet', 'scenarios'),
    'finished': ('finished', 'integration_mail', 'scenarios', 'views'), 'entry': ('entry', 'scenarios', 'views'),
    'kiosk': ('kiosk', 'views'), 'start': ('start', 'scenarios', 'views'), 'views': ('views', 'drive'), 'app': ('drive', 'scenarios', 'views')}

# Tests of the floor that are tried first for faults below a place, as --gtest_filter takes them; what survives them meets the whole suite.
FIRST = {
    'src/transfer/ftp/': 'FtpSender*:FtpGuards*', 'src/transfer/http/': 'UploadForm*:HttpSender*:ServerList*:UploadScript*:Multipart*',
    'src/transfer/report/': 'AReport*', 'src/views/': 'Keyboard.*:Presses.*:Panel.*:StartPage.*:HeldButton.*:Editor*'}

# Constants that must be variables for a fault to be chosen at run time.
VARIABLES = {
    'src/common/AnsiCodePage.cpp': [('constexpr std::array<char16_t, 128> upperHalf', 'const std::array<char16_t, 128> upperHalf'),
                                    ('constexpr auto byUnit', 'const auto byUnit')],
    'src/order/EditRecord.cpp': [('constexpr NumberField numberFields', 'const NumberField numberFields')],
    'src/assembly/OrderSheet.cpp': [('constexpr std::array<SizeStep, 5>', 'const std::array<SizeStep, 5>'),
                                    ('constexpr std::array<DeliveryPlace, 3> plainPlaces', 'const std::array<DeliveryPlace, 3> plainPlaces')]}

FAULTS = {
    'src/common/AnsiCodePage.cpp': [
        F('0x05D0', 'char16_t(MUTATED ? 0x05D1 : 0x05D0)', 'alef reaches the lab as "?" and comes back as bet'),
        F('0x20AA', 'char16_t(MUTATED ? 0x00A4 : 0x20AA)', 'the shekel sign is lost'),
        F('++i;', '', 'a sign beyond the code page becomes two "?", and all columns behind it move')],
    'src/common/DrivePath.cpp': [
        F('std::min<qsizetype>(4, name.size())', 'std::min<qsizetype>(3, name.size())', 'the point stays in the base name of every print'),
        F("name.replace(backslash, u']').replace(u':', u';')", "name.replace(backslash, u']')", 'a corrected picture is kept under another name')],
    'src/common/FixedText.cpp': [
        F("text.leftJustified(width, u' ', true)", "text.leftJustified(width, u' ')", 'a long text pushes the columns behind it'),
        F("QString::number(number).rightJustified(width, u'0').right(width)", "QString::number(number).rightJustified(width, u'0')",
          'line 10,000 of a basket gets five digits'),
        F('std::nearbyint(value)', 'std::floor(value)', 'a number of a record is one too small'),
        F('std::llrint(value)', 'std::llround(value)', 'pieces of a print are cut where the lab does not look'),
        F("c == u' ' || c == u'\\t' || c == u'\\n'", 'false', 'a field with a blank in front reads as 0'),
        F('std::clamp(6 - magnitude, 0, 60)', 'std::clamp(2 - magnitude, 0, 60)', 'gains are kept coarser than they are shown')],
    'src/common/HostFile.cpp': [
        F('synced && m_error == 0 && ::fsync(m_file.number()) != 0', 'false', 'a print or a state that the disk lost counts as written'),
        F('at->last_write_time(gone) < before', 'true', 'a file that another program is writing goes'),
        F('failure.kind != Failure::Kind::NoSpace', 'true', 'nobody learns that the disk is full'),
        F('done < count && !target.failed()', 'done < count && !target.failed() && done == 0', 'a piece over 1 MiB is cut')],
    'src/common/PaperSize.cpp': [F('paper.left(2) + between + paper.right(2)', 'paper.right(2) + between + paper.left(2)',
                                   '10/15 is ordered as 15/10')],

    'src/order/PrintCode.cpp': [
        F('LeftField(size, 4)', 'LeftField(size, 5)', 'paper and border move by a column'),
        F('LeftField(border, 2)', 'border', 'a border of three letters makes the code ten columns wide'),
        F('text.endsWith(QLatin1String("txt"))', 'false', 'a log counts as a picture'),
        F('maat == u"מבריק"_s', 'maat == u"מבריקי"_s', 'glossy orders are printed on another paper'),
        F('(all && maat == u"Matte"_s)', 'false', 'English matte orders have no paper'),
        F('std::floor(copies)', 'copies', 'a name that begins like 1.5 counts half a print more'),
        F('shemot.ppr == mixedSizes ? shemot.CustomCode : SizeCode(shemot.ppr)', 'SizeCode(shemot.ppr)',
          'an order of mixed sizes gets the code zzzz')],
    'src/order/PrintFileName.cpp': [
        F("QString::number(optint).rightJustified(2, u'0')", 'QString::number(optint)', 'the kind is one digit, and the lab misreads the name'),
        F('RightPart(AnsiCodePage::squeeze(baseName), 20)', 'RightPart(AnsiCodePage::squeeze(baseName), 19)',
          'two pictures of one name but its first letter are one'),
        F('ZeroPadded(index, 4)', 'ZeroPadded(index + 1, 4)', 'prints do not fit the lines of the log'),
        F('path.stem()', 'path.leaf()', 'the ending is part of the base name')],
    'src/order/OrderTail.cpp': [
        F('field(totalPics, 3)', 'field(totalPics, 4)', 'the tail has 41 bytes: the lab reads no print'),
        F('field(orderNumber, 3) + field(serial, 4)', 'field(serial, 4) + field(orderNumber, 3)', 'number and serial are exchanged'),
        F("u'^' + RightPart(AnsiCodePage::squeeze(base), 19)", 'RightPart(AnsiCodePage::squeeze(base), 20)', 'the long tail has no sign in front'),
        F('SugTzad == longWidth ? longForm(base) : SugTzad == shortWidth ? shortForm() : QByteArray()', 'shortForm()',
          'a lab that asks for 60 bytes gets 40', seen=True),
        F('state.Optint == OrderKind::Album && state.albumTail == AlbumTail::Photographer', 'state.albumTail == AlbumTail::Photographer',
          'plain orders carry a photographer who does not exist')],
    'src/order/PrintFile.cpp': [
        F('RoundHalfEven(static_cast<double>(length) / shape.chunks)', 'length / shape.chunks', 'half of all prints have pieces of another length'),
        F('bytes.append(static_cast<char>(i >> 8));', "bytes.append('\\0');", 'a shape of more than 255 pieces is damaged'),
        F('shape.base + piece', 'piece', 'no print can be read'),
        F('piece > 0 && (roundedUp || filled)', 'piece > 0 && roundedUp', 'zeros stay behind a picture that is read back'),
        F('2 * remainder < chunks', '2 * remainder <= chunks', 'a picture of one half is read back too long'),
        F('low + 256 * high != i', 'false', 'a print with exchanged pieces counts as good')],
    'src/order/BasketLine.cpp': [
        F('form == LineForm::Full ? PrintCode::width + EditRecord::width : PrintCode::width', 'PrintCode::width + EditRecord::width',
          'plain orders find no picture'),
        F('path.leaf().size() >= 5', 'path.leaf().size() >= 4', 'a name without a stem becomes a print')],
    'src/order/OrderNames.cpp': [
        F('ZeroPadded(day.month(), 2)', 'QString::number(day.month())', 'orders of nine months have another name'),
        F('LeftField(kodMishloach, 3)', 'kodMishloach', 'a start code of four letters lengthens the name'),
        F("u'!' + number + u'_' + serial + ending", "u'!' + number + ending", 'the lab does not find the sheet'),
        F("folder.endsWith(u'P')", "folder.endsWith(u'p')", 'an order in pieces is sent whole')],
    'src/order/OrderFolder.cpp': [
        F('!m_path.isEmpty() && m_path.text() != notChosen', '!m_path.isEmpty()', 'nothing chosen counts as an order'),
        F('taken.contains(number)', 'false', 'a number is given twice'),
        F("marked ? name + u'P' : name", 'name', 'the lab does not know that an order comes in pieces'),
        F('TravelsInPieces(number) ? number.chopped(1) : number', 'number', 'the number of an order in pieces is given twice')],
    'src/order/PieceName.cpp': [
        F("QString::number(number).rightJustified(3, u'0')", 'QString::number(number)', 'pieces are named so that they can not be joined'),
        F('name.right(11).mid(4, 3)', 'name.right(11).left(3)', 'a family counts as whole when it is not'),
        F("without(leaf, endingLength) + u'_' + leaf.right(3)", 'without(leaf, endingLength) + leaf.right(3)', 'a joined print has another name')],
    'src/order/TailTelephone.cpp': [
        F('m_state.Careful ? squeezed(typed) : typed', 'typed', 'the last digits of a telephone number are cut'),
        F("number.replace(0, 4, u'0');", 'number.remove(0, 4);', 'a number from abroad lacks its 0')],
    'src/order/BrokenFiles.cpp': [
        F('LeafName(path) == leafName', 'path == leafName', 'a broken file counts as arrived'),
        F('AnsiCodePage::encode(path) + "\\r\\n"', 'AnsiCodePage::encode(path)', 'two broken files become one name')],
    'src/order/OrderFields.cpp': [
        F('&shemot.n2', '&shemot.n3', 'the lab calls the address'),
        F('u"Shemot.TotalPics"_s', 'u"TotalPics"_s', 'the lab reads no total'),
        F('album.Tosafot1[i - 1]', 'album.Tosafot1[i]', 'extras of an album move by one')],
    'src/order/OrderLog.cpp': [
        F('u"fail_"_s', 'u"fail"_s', 'failed pictures are not read'),
        F('QString::number(failed.size())', 'QString::number(0)', 'the log hides that pictures are missing'),
        F('Fixed{u"5"_s}', 'Fixed{u"2"_s}', 'the lab refuses edited orders'),
        F('album ? Lines{zeros, zeros} : Lines{zeros}', 'Lines{zeros}', 'an album is read as a plain order'),
        F('album ? QString() : u"Shemot."_s', 'QString()', 'the key of the version is another'),
        F("QString(45, u'*')", "QString(44, u'*')", 'the line above the failed pictures is another'),
        F('Optint = OrderKind::EditedPrint;', '', 'an edited order that is read back counts as plain')],
    'src/order/EditRecord.cpp': [
        F('record.mid(column.position - 1, column.width)', 'record.mid(column.position, column.width)', 'each field is read a column too far'),
        F('std::clamp(from + step, 40, 210)', 'std::clamp(from + step, 40, 200)', 'the zoom ends early'),
        F('isDamaged(column) ? 1.0F : static_cast<float>(Val(text(column).trimmed()))', 'static_cast<float>(Val(text(column).trimmed()))',
          'a damaged record prints black'),
        F('std::max<std::int16_t>(8, fields.TextFontSize)', 'fields.TextFontSize', 'a caption may vanish'),
        F('&EditFields::TextRed', '&EditFields::TextBlue', "a caption's red is its blue"),
        F('frame != R::noFrame && fields.FrameName == R::noFrame', 'frame != R::noFrame', "the order's border replaces the chosen frame"),
        F('u"ddd"_s', 'u"   "_s', 'the mark of the record is missing'),
        F('from + step > 540 ? std::int16_t{180} : HoldIn16Bits(from + step)', 'HoldIn16Bits(from + step)',
          'a turn of more than a circle has four columns')],
    'src/order/OrderReport.cpp': [
        F('u"?k1="_s', 'u"?k="_s', 'the lab does not learn whose order it is'),
        F("letter == u'\\r' || letter == u'\\n' || letter == QChar(u'\\0')", "letter == u'\\r'", 'a remark cuts the report'),
        F('SizeCode(shemot.ppr, u"_"_s)', 'SizeCode(shemot.ppr)', 'the size in the report is another'),
        F('u"%&#+"_s', 'u"%#+"_s', 'an & in a name cuts the report'),
        F('transfer.SugMishloah == Sending::NewOrder || transfer.SugMishloah == Sending::Resend', 'transfer.SugMishloah == Sending::NewOrder',
          'an order that is sent again is not told')],
    'src/order/OrderState.cpp': [
        F('entries.last().value == QString::number(entries.size() - 1)', 'true', 'a state that lost lines is believed'),
        F('text.replace(u"%0A"_s, u"\\n"_s).replace(u"%0D"_s, u"\\r"_s).replace(u"%25"_s, u"%"_s)',
          'text.replace(u"%25"_s, u"%"_s).replace(u"%0A"_s, u"\\n"_s).replace(u"%0D"_s, u"\\r"_s)', 'a caption with %0A gets a line break'),
        F('phase <= Phase::Prepared', 'phase < Phase::Prepared', 'a prepared order can not get another number'),
        F('writer.truth("FolderMadeByUs", folderMadeByUs);', 'writer.truth("FolderMadeByUs", false);', 'after a restart the own folder is foreign'),
        F('phase == Phase::Sending && filesInAll > 0', 'false', 'after a restart nothing tells how far the sending has come')],
    'src/order/ArrivalProof.cpp': [
        F('**found == length', '**found >= length', 'a longer file of another order counts as arrived'),
        F('name == sharedName', 'false', 'the common picture of another order holds the order up'),
        F('!kept || *length > *kept', '!kept || *length < *kept', 'of two lengths the shorter is believed'),
        F('measured.contains(endingOf(name)) ? proof.missing : proof.byName', 'proof.byName', 'a file without a length counts as arrived')],
    'src/order/OrderCompleteness.cpp': [
        F('n >= declared - 1', 'n >= 1', 'the first piece counts for the whole print'),
        F('sent() < *named', 'false', 'an order that lacks prints goes without a question'),
        F('std::max(0, usable - static_cast<int>(log.failed.size()))', 'usable', 'pictures that were left out are asked for without an end')],
    'src/order/CouponLimit.cpp': [
        F('size == u"10/15" ? coupon.SmallCount : coupon.LargeCount', 'coupon.SmallCount', 'a large coupon takes 220 prints', seen=True),
        F('coupon.HaKoopon == 1 && !(m_state.Careful && hasNone)', 'coupon.HaKoopon == 1', 'an album is refused for a coupon')],
    'src/order/UnfinishedOrders.cpp': [
        F('before->phase <= Phase::Prepared', 'true', 'an order on its way is thrown away'),
        F('!failed || !failed->isEmpty()', '!failed', 'an order is thrown away although pictures are missing in its successor'),
        F('state.transfer.HazmanaP = inPieces ? 1 : 0;', '', 'an order in pieces goes on whole'),
        F('!now.isEmpty() && now != mark', 'false', 'another picture is printed under the same path'),
        F('edit.RedMarker == EditRecord::corrected ? WorkspacePaths::corrected(state, line.path) : line.path', 'line.path', 'eyes print red')],
    'src/order/OrderJournal.cpp': [
        F('next.filesInHand += path;', '', 'after a kill a file that was cut counts as arrived'),
        F('next.filesInHand.removeAll(path);', '', 'each file is sent again after a restart'),
        F('next.report = OrderState::Report::Begun;', '', 'after a kill the lab is told twice'),
        F('std::max(next.phase, Phase::Sending)', 'Phase::Sending', 'an order that has arrived counts as under way'),
        F('m_state.report = OrderState::Report::Begun;', '', 'with a damaged state the lab is told twice'),
        F('lines == m_state.items && m_state.marks.size() == lines.size()', 'false', 'another card is not noticed when an order goes on')],
    'src/order/HistoryState.cpp': [
        F('order->phase >= OrderState::Phase::Arrived', 'order->phase >= OrderState::Phase::Prepared', 'clean-up takes orders that were never sent'),
        F('state.Careful && count() > 0', 'false', 'clean-up asks nothing')],
    'src/order/CompletenessGuard.cpp': [F('return askForFewer(counts);', 'return true;', 'an order that lacks pictures leaves unasked')],
    'src/order/LeftOutPictures.cpp': [
        F('static_cast<void>(files.removeFile(thumbnails / name));', 'static_cast<void>(name);', 'the next sheet shows pictures of the one before', seen=True),
        F('HasQuestionMark(path) ? LeftOut::Why::Name : LeftOut::Why::NotTold', 'LeftOut::Why::NotTold',
          'nobody is told that the name of a picture is at fault')],
    'src/order/KeptPictures.cpp': [F('!made && has(picture) ? copyOf(picture) : picture', 'picture', 'what was copied is lost with its card')],
    'src/order/LineEnds.cpp': [F('return {-cr, -crlf, lf, lf - crlf};', 'return {-cr, -crlf, lf, lf};', 'a server that adds CR is not recognised')],

    'src/platform/line/FtpListing.cpp': [
        F("line[0] == '-' ? lengthOf(length) : std::nullopt", 'std::optional<qint64>()', 'listings tell no length'),
        F('line.mid(fields[kind].end + 1)', 'line.mid(fields[kind].end)', 'names of a DOS listing begin with a blank'),
        F('value.toLower().endsWith("dir")', 'value.toLower() == "dir"', 'the folder itself counts as a file'),
        F('half == "AM" || half == "PM"', 'half == "AM"', 'listings of the afternoon are not read'),
        F('others.size() == 1 && isSentence(others.first())', 'false', '"No files found" counts as a file'),
        F("fact.startsWith('s')", 'false', 'listings of one style tell no length')],
    'src/platform/line/FtpSessionWire.cpp': [
        F('!completed(end.code)', 'false', 'a put that the server refused at its end counts as sent', seen=True),
        F('code >= 200 && code <= 299', 'code >= 200', 'each refusal counts as good'),
        F('type == FtpType::Ascii ? "TYPE A" : "TYPE I"', '"TYPE I"', 'the lab gets another transfer type', seen=True),
        F('numbers[4] * 256 + numbers[5]', 'numbers[4] + numbers[5] * 256', 'no file goes where EPSV is not known'),
        F('reply.code == 0 || reply.code == code', 'true', 'a reply of several lines is cut', seen=True),
        F('direction == Direction::Up ? endOfPut(data.socket) : noFailure()', 'noFailure()', 'a cut behind the last bytes counts as sent', seen=True),
        F('data.setLinger(true, 0);', '', 'a part of a file that can not be read on counts as the whole'),
        F('reason.code >= 400 ? refused(reason) : cut', 'cut', 'a full disk is told as a bad line'),
        F('reply.code == 213 && known && bytes >= 0 ? Length(bytes) : Length()', 'Length()', 'SIZE tells nothing'),
        F('m_home + directory', 'directory', 'orders land in another folder'),
        F('setType(FtpType::Image)', 'setType(m_type)', 'a server counts line ends into the length'),
        F('greeting.code >= 100 && greeting.code < 200 && delays < mostDelays', 'false', 'a busy server is refused')],
    'src/platform/line/HttpCall.cpp': [
        F('asking.method != Request::HTTP_HEAD && received < answer.length.value_or(received)', 'false', 'half a list is believed', seen=True),
        F('answer.status >= 307', 'true', 'a post that was sent elsewhere counts as arrived'),
        F('hostAndPort(*to) == hostAndPort(from)', 'true', 'an order follows to a foreign server'),
        F("c == ' ' || c == '\\r' || c == '\\n' || c == '\\0'", "c == ' '", 'a line break in an address is a request of its own')],
    'src/platform/line/MailText.cpp': [F('"filename*=UTF-8\'\'" + name.toUtf8().toPercentEncoding()', '"filename=\\"" + name.toUtf8() + \'"\'',
                                         'a package arrives under a garbled name')],
    'src/platform/line/SmtpReply.cpp': [
        F('code == 452', 'false', 'a full mailbox is told as a busy server'),
        F('step == SmtpStep::Recipient ? MailEnd::RecipientRefused : MailEnd::Refused', 'MailEnd::Refused', 'a wrong address is not told as one')],
    'src/platform/line/SmtpMail.cpp': [F('!isPositiveCompletion(code)', 'false', 'a letter that was refused counts as sent')],
    'src/platform/files/Files.cpp': [
        F("!at->path().filename().native().starts_with('.')", 'true', 'state and kept work travel to the lab'),
        F('pattern[p].toCaseFolded() == name[n].toCaseFolded()', 'pattern[p] == name[n]', 'pictures named .JPG are not offered'),
        F("!folder.text().contains(u'\\\\') || QStringList{QString(), u\".\"_s, u\"..\"_s}.contains(path.leaf())", 'false', 'all of a drive may go')],
    'src/platform/files/HostPath.cpp': [F('QChar(static_cast<char16_t>(escapeBase + lead))', "QChar(u'?')",
                                          'pictures with foreign names can not be ordered')],

    'src/imaging/files/JpegWriter.cpp': [
        F('std::clamp(quality, 0, 100)', '75', 'prints are coarser than ordered'),
        F('onWhite(picture).image()', 'picture.image()', 'what is transparent prints black')],
    'src/imaging/files/JpegReader.cpp': [F('inverted ? inks[ink] : 255 - inks[ink]', '255 - inks[ink]', 'pictures for the press print as negatives')],
    'src/imaging/files/JpegCheck.cpp': [
        F('input->format() != PictureInput::Format::Jpeg', 'false', 'another kind of file goes to the lab as a JPEG',
          told='the reader of JPEG files refuses it as well, in other words'),
        F('picture ? Result<void>() : picture.failure()', 'Result<void>()', 'a file that is no picture goes to the lab as a print')],
    'src/imaging/files/BmpFile.cpp': [F('(width * pixelSize + 3) / 4 * 4', 'width * pixelSize', 'previews and corrected copies lean')],
    'src/imaging/drawing/ColourPlanes.cpp': [F('qRed(line[x])', 'qBlue(line[x])', 'prints have no red')],
    'src/imaging/drawing/ColourMatrix.cpp': [
        F('matrix.m_entries[4] = green;', 'matrix.m_entries[4] = red;', 'a change of red changes green too'),
        F('value < 0.0F || value > 0.0015F', 'value < 0.0F || value > 0.5F', 'a grey picture stays in colour',
          told='no matrix has ones in its diagonal and more than a thousandth beside it')],
    'src/imaging/drawing/CaptionDraw.cpp': [
        F('-length / 2', '-length', 'a caption in the middle stands at the side'),
        F('place.rotate(90);', '', 'a caption that runs down lies'),
        F('painter.fillPath(text, caption.colour);', 'painter.fillPath(text, QColor(Qt::black));', 'each caption is black'),
        F('anchor - QPointF(2 * scale.x, 2 * scale.y)', 'anchor', 'a caption covers its shadow')],
    'src/imaging/scaling/PlaneScaler.cpp': [
        F('cubic((k - centre) / widened)', 'cubic(k - centre)', 'prints have jagged edges'),
        F('(axis.first + i + 0.5) * axis.step - 0.5', '(axis.first + i) * axis.step', 'prints are moved by part of a pixel')],

    'src/session/Workspace.cpp': [
        F('qsizetype i = 1;', 'qsizetype i = MUTATED ? 0 : 1;', 'clean-up takes the sheets'),
        F('keeps && keeps(folder)', 'false', 'clean-up takes orders that were not sent'),
        F('counterValue(m_state.MisparHazmana) + 1', 'counterValue(m_state.MisparHazmana)', 'two orders have one number'),
        F('counterValue(firstLine(*stored).value_or(QString())) >= next', 'false', 'the counter goes back'),
        F('u"100"_s', 'u"1"_s', 'numbers begin at 1'),
        F('name.endsWith(ending) || name.endsWith(ending.toUpper())', 'true', 'files go that only look like scratch')],
    'src/session/lab/LabKeys.cpp': [
        F('number(at(&P::JppChunks), 1, 32767)', 'number(at(&P::JppChunks), 0, 32767)', 'a lab may ask for prints of no piece'),
        F('FtpType::Image', 'FtpType::Ascii', 'a lab can not set the type I'),
        F('yesNo(at(&D::Careful), true, false)', 'yesNo(at(&D::Careful), false, false)', 'no guard can be set'),
        F('u"(?!00)[0-9]{2}/(?!00)[0-9]{2}"_s', 'u"[0-9]{2}/[0-9]{2}"_s', 'a paper of no width is offered')],
    'src/session/lab/SettingsText.cpp': [F('piece(u"TK1="_s, profile.FtpFolder1) + piece(u"TK1="_s, profile.FtpFolder1)',
                                           'piece(u"TK1="_s, profile.FtpFolder1)', 'a reader drops the first folder')],
    'src/session/lab/ClientProfile.cpp': [F('deployment.HaKoopon == 1 ? 3 : 0', 'deployment.HaKoopon == 1 ? 220 : 0',
                                            'a large coupon takes 220 prints')],
    'src/session/PageFlow.cpp': [F('PreparedForHttp, UploadForm, IsLeft', 'PreparedForHttp, MUTATED ? FtpFrm : UploadForm, IsLeft',
                                   'orders by HTTP go by FTP')],
    'src/session/TextList.cpp': [F('--m_currentIndex;', '', 'the mark stands on another order or picture')],

    'src/selection/Basket.cpp': [F('m_copies -= PrintCode::copiesOf(old);', '', 'the customer is told too many prints')],
    'src/selection/FinishRule.cpp': [
        F('paper->longSide < 45', 'paper->longSide <= 45', 'large papers are sent scaled'),
        F('couponPictures < total', 'couponPictures <= total', 'a coupon can not be used up')],
    'src/selection/PictureChoice.cpp': [
        F('std::clamp(copies, 0, PrintCode::mostCopies)', 'copies', '100 copies take three columns'),
        F('BasketLine::withCopies(m_basket.item(index), copies)', 'm_basket.item(index)', 'one copy is printed whatever was chosen'),
        F('m_state.Careful ? m_basket.FindByPath(path) : -1', '-1', 'the whole folder takes the copies back'),
        F('code(PrintCode::copiesOf(m_basket.item(index)), PaperWords::All)', 'code(1, PaperWords::All)', 'editing takes the copies back'),
        F('m_state.Careful ? PaperWords::All : PaperWords::WholeFolder', 'PaperWords::WholeFolder', 'a whole folder in English has no paper',
          seen=True)],
    'src/selection/OrderResolution.cpp': [
        F('m_state.DchisaAmoka == 1', 'false', 'a picture that is sent whole is called coarse',
          told='only a panorama, and the order is the same'),
        F('resolution->grade() == PrintResolution::Grade::Coarse', 'resolution->grade() != PrintResolution::Grade::Sharp',
          'fair pictures are called coarse'),
        F('record.isEmpty() ? EditRecord::newPicture() : record', 'EditRecord::newPicture()', 'a zoomed picture is not told to be coarse')],
    'src/selection/CardCopies.cpp': [
        F('(copied != picture.source.stamp.length || stampOf(picture.source.file) != picture.source.stamp)', 'false', 'half a picture counts as copied',
          told='the card must change within a copy; a cut copy is told as damaged where its print is made')],
    'src/selection/pictures/kyoskNewCopies.cpp': [
        F('count.waiting += state == CopyState::Waiting;', '', 'the card may be taken out too early')],
    'src/selection/SeenPages.cpp': [
        F('m_pages.back().start >= lines', 'false', 'the page of pictures that are no longer chosen comes back empty'),
        F('m_state.Careful && start + cellsOfPage >= lines', 'false', 'one of many chosen pictures is shown')],
    'src/selection/HomeAddress.cpp': [F('m_state.BranchChoice == home', 'false', 'prints are to be delivered nowhere')],
    'src/selection/pictures/kyoskNewFinish.cpp': [
        F('Text2.text + u" - "_s + m_state.BranchChoice', 'Text2.text', 'the lab does not learn the branch', seen=True),
        F('address.isEmpty() ? mailNotTyped : address', 'address', 'no address reads as a fault at the lab'),
        F('plain() ? mailNotTyped : m_state.shemot.Mail', 'm_state.shemot.Mail', 'the address of an earlier customer goes with the order'),
        F('deep ? 1 : 0', '0', 'deep compression can not be chosen'),
        F('leaveEditor(); // a picture', 'if (!MUTATED) leaveEditor(); // a picture', 'the last edits are lost')],
    'src/selection/pictures/kyoskNewChoosing.cpp': [
        F('StoredSmallView::discard(m_state, m_platform.files, DrivePath(path));', '', 'a picture shows edits that it no longer has'),
        F('UnpackEditState(record.value_or(EditRecord::newPicture()), m_state.edit);', 'UnpackEditState(EditRecord::newPicture(), m_state.edit);',
          'a picture chosen again loses its edits')],

    'src/selection/pictures/kyoskNewDoor.cpp': [
        F('m_choice.remove(path);', '', 'a picture that can not be printed stays in the order'),
        F('m_wait.takeOut(shownPath(path).leaf());', '', 'a picture is taken out of the order and nobody is told')],
    'src/selection/SmallPictures.cpp': [
        F('u"%1|%2|%3|"_s.arg(cell).arg(length).arg(time)', 'u"%1|"_s.arg(cell)', 'a cell shows the picture of an earlier card')],
    'src/selection/door/DoorNames.cpp': [
        F('taken.contains(made.toCaseFolded())', 'false', 'two pictures get one name, and one of them is printed twice'),
        F('AnsiCodePage::holds(name)', 'true', 'a picture is left out for the letters of its name')],
    'src/selection/door/DoorWait.cpp': [
        F('m_waits = m_waiting > 0;', 'm_waits = false;', 'the order goes on before its pictures are made'),
        F('m_notMade.isEmpty() ? Then::GoOn : Then::TellNotMade', 'Then::GoOn', 'the order goes on without what the disk has not taken'),
        F('!std::exchange(m_toldAtOnce, true)', 'true', 'a full disk opens a box for each picture')],
    'src/selection/door/PictureDoor.cpp': [
        F('!std::filesystem::exists(file, none) || stampOf(file).time == stampOf(source).time', 'true',
          'the picture of an earlier card is printed in the place of this one'),
        F('now == known->source.stamp', 'true', 'a picture of another card is taken for the one before'),
        F('return copied != picture.source.stamp;', 'return false;', 'the picture of another card is printed'),
        F('picture && picture->state == State::NotMade', 'false', 'what a full disk has not taken is never tried again'),
        F('isThePictures(made.failure()) && (picture.fromCopy || canBeRead(picture))', 'true',
          'a full disk takes whole pictures out of the order'),
        F('m_draftsWanted += worked;', '', 'a page of a telephone shows clocks until its pictures are made'),
        F('m_isChosen && m_isChosen(picture.worked)', 'false', 'a chosen picture goes to make room'),
        F('!untold && std::filesystem::last_write_time(source, passedOver) == time', 'false', 'each visit of a page makes its pictures again')],

    'src/door/DoorDecoder.cpp': [
        F('readPart(file, size - 2, 2, error) == "\\xFF\\xD9"', 'true', 'half a picture of a decoder that died is printed'),
        F('doorNeedOf(*header, u".jpg"_s) == DoorNeed::Nothing', 'true', 'what a decoder that was taken over writes is believed'),
        F('failure.kind = Failure::Kind::NotFound;', '', 'a card that breaks is told as a fault that nobody knows')],
    'src/door/DoorNeed.cpp': [
        F('rules.srgb && coloursOf(header).source != Source::None', 'false', 'a picture of other colours is printed pale'),
        F('rules.upright && header.orientation != 1', 'false', 'a picture lies on its side'),
        F('fileName.endsWith(u".jpg"_s) || fileName.endsWith(u".JPG"_s)', 'true', 'a picture is left out for its ending'),
        F('broken = true;', '', 'nobody learns that a broken profile was left aside')],
    'src/door/PictureHeader.cpp': [
        F('value >= 1 && value <= 8 ? value : 1', 'value', 'an orientation that there is not turns a picture'),
        F('m_broken || static_cast<int>(m_parts.size()) != m_total || m_parts.rbegin()->first != m_total', 'false', 'half a profile is used',
          told='its stated length tells that it is not whole')],
    'src/door/ProfileJudge.cpp': [
        F('std::abs(encodedSrgb(*light) - value) <= tolerance', 'true', 'sRGB lights with another curve are printed too dark')],
    'src/door/StoredPicture.cpp': [
        F('width * height > maxDoorPixels', 'false', 'a picture of more than 100 million pixels is decoded'),
        F('m_kind == PictureKind::Gif && !hasWholeGifFrame(m_bytes)', 'false', 'a GIF that was cut short is printed'),
        F('picture.colours = byProfile;', '', 'a HEIC of P3 is printed pale'),
        F('isWide(handle) == isWide(picture)', 'true', 'a draft lies on its side', told='only until the picture itself is there'),
        F('reader.setAutoTransform(m_kind == PictureKind::Tiff);', 'reader.setAutoTransform(false);', 'a TIFF lies on its side')],
    'src/door/UprightJpeg.cpp': [
        F('TJXOPT_PERFECT | TJXOPT_COPYNONE', 'TJXOPT_COPYNONE', 'a turned picture has a strip of its other side at an edge'),
        F('picture = upright(std::move(picture), stored.orientation);', '', 'a PNG lies on its side'),
        F('conversion && conversion->fits(picture.image)', 'false', 'no colours are converted')],
    'src/platform/media/CardSummary.cpp': [
        F("name.startsWith(u'.')", 'false', 'hidden files count as pictures'),
        F('of->number > known->second.first', 'of->number < known->second.first', 'the card opens at its oldest pictures'),
        F('m_stop || ++m_entries > mostEntries', 'false', 'a damaged card is counted without an end')],
    'src/platform/media/MediaFolders.cpp': [
        F('m_told && media == m_last', 'false', 'the page draws its cards anew each second',
          told='what is drawn is the same'),
        F('m_isMounted(folder)', 'true', 'a folder that is no card is offered')],

    'src/entry/album/AlbumCheck.cpp': [
        F('album.SoogLBM == notChosen', 'false', 'an album without a kind is ordered'),
        F('state.shemot.maat = u"M"_s;', 'state.shemot.maat = u"G"_s;', 'albums are on another paper'),
        F('extra.clear();', '', 'the prompt of a list is ordered as an extra')],
    'src/order/AlbumChoicesTexts.cpp': [F('list.items.value(row, list.prompt)', 'list.items.value(row)', 'an untouched list passes for a choice')],
    'src/entry/details/DetailsCheck.cpp': [
        F('shemot.n2 = telephone.trimmed();', 'shemot.n2 = telephone;', 'blanks take the columns of the telephone'),
        F('shemot.n2.isEmpty()', 'false', 'an order has no telephone'),
        F('shemot.ppr == notChosen', 'false', 'an order has no size'),
        F('address.trimmed().isEmpty() && state.MishloachHabaita', 'false', 'prints are to be delivered nowhere')],
    'src/entry/details/DetailStore.cpp': [
        F('store.text(customer.telephone).endLine();', 'store.text(customer.name).endLine();', 'the name comes back as the telephone'),
        F('line.size() > 4 ? WithoutEnds(line) : QString()', 'WithoutEnds(line)', 'a sign of the store comes back as a name')],

    'src/editing/render/EditedPicture.cpp': [
        F('edit.TextAlign == R::alignFar', 'false', 'a caption at the far side prints at the near one'),
        F('(edit.TextStyle & 2) != 0', 'false', 'an italic caption prints upright'),
        F('R::stored(R::TextY, edit.TextY)', 'edit.TextY', 'a caption is seen where the record can not have it'),
        F('edit.ToneFlag == 1 ? loadGreyPart(print, wanted, part) : loadPicturePart(print.file, wanted, part)',
          'loadPicturePart(print.file, wanted, part)', 'a grey picture prints in colour'),
        F('coloursOf(edit).apply(picture);', '', 'brightness is seen and not printed'),
        F('{geometry.scaleX, geometry.scaleY}', '{geometry.scaleX, MUTATED ? geometry.scaleX : geometry.scaleY}', 'a caption prints in another height',
          told='the two are one for each paper'),
        F('QStringList{name, seen}', 'QStringList{seen, name}', 'the frame of the screen prints'),
        F('coversPaper(edit) && printPlacement(m_file, print, edit).covers(print.size)', 'coversPaper(edit)',
          'a turned picture covers the preview and not the print', told='the two differ by rounding alone'),
        F('placement.panX *= scale;', '', 'on a sharp screen a moved picture is seen beside its place'),
        F('m_sharp = grey.applied(m_sharp);', '', 'on a sharp screen a grey picture is seen in colour'),
        F('!print.background && !(shows && placement.covers(geometry.size))', 'false', 'what the picture leaves bare prints white')],
    'src/editing/render/PicturePlacement.cpp': [
        F('height < box.height', 'height > box.height', 'the preview shows white that is not printed'),
        F('print.size.height > placement.drawHeight', 'print.size.height < placement.drawHeight', 'prints have white edges'),
        F('placement.panX *= print.scaleX;', '', 'a moved picture prints in the corner'),
        F('picture.height < picture.width', 'picture.height <= picture.width', 'square pictures print lying')],
    'src/editing/render/PlainPrint.cpp': [F('width > source.width || rounded > source.height', 'false', 'small pictures are blown up')],
    'src/editing/render/TextLabelPlace.cpp': [F('box.left -= box.width / 2;', '', 'the label of a caption stands beside it')],
    'src/editing/render/FrameScramble.cpp': [F('bytes->mid(2 * block)', 'bytes->mid(block)', 'packed frames are damaged')],
    'src/editing/render/FrameLists.cpp': [F('name.size() <= longestCategory', 'true', 'a frame is chosen whose folder the record cuts')],
    'src/editing/editor/CoverZoom.cpp': [
        F('m_own = std::exchange(edit.ZoomPercent, raised);', 'edit.ZoomPercent = raised;', "the customer's own zoom does not come back"),
        F('isRaisedToTheLast(edit) || picture.coversPaper(edit)', 'picture.coversPaper(edit)', 'the zoom jumps with each turn')],
    'src/editing/editor/SeenFrame.cpp': [
        F('edit.FrameName = EditRecord::frameRemoved;', '', 'a frame that is not seen prints'),
        F('m_state.Careful || before', 'before', 'a frame is taken, prints and is not seen')],
    'src/editing/editor/EditLimits.cpp': [F('edit.RotationCode < least', 'false', 'a turn takes four columns'),
                                          F('std::clamp<std::int16_t>(edit.TextFontSize, 8, 98)', 'edit.TextFontSize',
                                            'a caption of size 100 prints as 10')],
    'src/editing/editor/ColourStep.cpp': [
        F('EditStep::gain(1, -20)', 'EditStep::gain(1, 20)', 'sepia is violet'),
        F('EditStep::gain(edit.GainB, -step)', 'edit.GainB', 'more red leaves blue'),
        F('edit.ToneFlag = 1;', '', 'a grey picture prints in colour')],
    'src/editing/editor/tFrmNew.cpp': [
        F('workPicture()->placeAtCentreIfUnset(m_edit);', '', 'a picture that was opened once has no place'),
        F('m_edit.RedMarker = EditRecord::notMarked;', '', 'a picture whose correction is lost has no print'),
        F('m_edit.ToneFlag == 1', 'false', 'a grey picture opens in colour'),
        F('m_edit.GainR = m_edit.GainG = m_edit.GainB = 1;', '', 'the next picture takes the brightness of the one before')],
    'src/editing/editor/tFrmNewCaption.cpp': [
        F('m_edit.TextY = static_cast<std::int16_t>(anchor.y());', '', 'a dragged caption prints at its former height'),
        F('m_captionGuard.keepsDraggedPlace()', 'false', 'a dragged caption prints at its former place')],
    'src/editing/editor/tFrmNewFrames.cpp': [
        F('m_edit.FrameFolder = Combo4.text;', '', 'the frame of another category prints'),
        F('m_edit.FrameName = EditRecord::frameRemoved;', '', 'a frame that was taken away prints')],
    'src/editing/editor/tFrmNewMove.cpp': [F('PackEditState();', '', 'a zoom is shown and not printed'),
                                           F('meanwhile.PanX = HoldIn16Bits(Image3.position().x());', '', 'a dragged picture does not follow',
          told='the record and the print are right once the finger is lifted'),
                                           F('opening != m_openings', 'false', 'the zoom of one picture is stored with another',
                                             told='the picture that came has a zoom of its own by then'),
                                           F('PreviewZoom = m_edit.ZoomPercent;', '', 'a held zoom jumps after a turn')],
    'src/editing/caption/CaptionStep.cpp': [
        F('edit.TextY + down', 'edit.TextY - down', 'the arrow moves the caption the other way'),
        F('edit.TextStyle > 2', 'edit.TextStyle > 1', 'no caption is bold and italic')],
    'src/editing/caption/mikledet.cpp': [
        F('m_edit.TextOn = on ? 1 : 0;', 'm_edit.TextOn = 1;', 'a caption that was taken off prints'),
        F('m_edit.TextFont = Combo1.text;', '', 'the caption prints in another font than was chosen', told='no page fills the list of fonts'),
        F('m_edit.TextAlign = static_cast<std::int16_t>(alignment);', '', 'the caption prints at another side than was chosen')],
    'src/editing/redeye/KeptCorrection.cpp': [
        F('goesOn ? copy : picture', 'picture', 'a second visit throws the first correction away'),
        F('m_state.Careful && !picture.differsFromFile()', 'false', 'a picture without a correction is marked as corrected')],
    'src/editing/caption/CaptionGuard.cpp': [F('edit.TextOn = 1;', '', 'a caption that is opened again is not printed')],
    'src/editing/caption/KeyLayout.cpp': [F('AnsiCodePage::squeeze(text) != text', 'false', 'a caption shows signs that the record has not')],

    'src/assembly/Preparation.cpp': [
        F('m_failed += picture.text();', '', 'the log hides pictures that were left out'),
        F('m_state.transfer.leftOut += LeftOut{picture, why};', '', 'the customer is not told of pictures left out'),
        F('m_state.Careful && m_prints == 0 && m_there.isEmpty()', 'false', 'an order without a print is sent'),
        F('m_goesOn && m_journal->state().items == m_lines', 'm_goesOn', 'prints of another basket stay',
          told='an order that is taken up starts at once with the lines of its state'),
        F('m_there.isEmpty() && !PrintFits(m_state, m_platform.files, print)', 'false', 'an order has prints of two shapes')],
    'src/assembly/OrderSheet.cpp': [
        F('{70, {660, 880}, {660, 880}},', '{MUTATED ? 71 : 70, {660, 880}, {660, 880}},', 'sheets of 71 pictures are too small', seen=True),
        F('items <= step.upTo', 'items < step.upTo', 'sheets at a step are too large'),
        F('u"LOB"', 'u"LOK"', 'the sheet does not tell where the prints are fetched', seen=True),
        F('(sheetCellSize + 2) * (i % columns) + 5', 'sheetCellSize * (i % columns) + 5', 'pictures of the sheet touch'),
        F('= size.width / sheetCellSize - 2', '= size.width / sheetCellSize - 1', 'more pictures than the sheet has room for'),
        F('ratio >= 1', 'ratio > 1', 'square pictures stand on the sheet'),
        F('return {255, 192, 255};', 'return {255, 255, 192};', 'mixed sizes are not marked by their colour')],
    'src/assembly/PaperResize.cpp': [
        F('target, printQuality', 'target, 70', 'plain prints are coarser than agreed')],
    'src/assembly/PrintPacker.cpp': [
        F('m_files.fileExists(print) ? m_files.removeFile(print) : Result<void>()', 'Result<void>()', 'half of a print that the log names as failed is sent'),
        F('static_cast<void>(picture());', '', 'a print that was made ahead comes out as its neighbour'),
        F('m_tail.form(m_tailForm, base)', 'm_tail.form(m_tailForm, line.code)', 'the tail names another picture')],
    'src/assembly/plain/PlainPrints.cpp': [
        F('m_lines.back().hasUsableName() && !HasQuestionMark(items[i])', 'm_lines.back().hasUsableName()',
          'each print behind an odd name is that of its neighbour'),
        F('m_wanted[i] && !m_ready[i]', 'm_wanted[i]', 'the prints that the sheet has no room for are those of others')],
    'src/imaging/scaling/ShrunkPlanes.cpp': [
        F('blocksAStep) + area / 2', 'blocksAStep)', 'the pictures of the sheet are darker than those on the screen')],
    'src/assembly/plain/PlainPreparation.cpp': [
        F('ending == u"JPG" || ending == u"jpg"', 'ending == u"jpg"', 'pictures of most cameras are left out'),
        F('RightPart(split(line).path.stem(), 9)', 'RightPart(split(line).path.stem(), 8)', 'the sheet cuts the names',
          told='a letter of a caption; log and print carry the whole name'),
        F('encodeJpeg(*drawn, printQuality)', 'encodeJpeg(*drawn, 50)', 'the sheet is coarse')],
    'src/assembly/edited/EditedPreparation.cpp': [
        F('OrderTail::shortWidth', 'OrderTail::longWidth', 'edited orders have a tail that the lab does not read'),
        F('name.size() - 8', 'name.size() - 4', 'captions of the sheet are longer',
          told='the ending stands in a caption too; log and print carry the name')],
    'src/order/KeptWork.cpp': [
        F('copy == line.path || !m_files.fileExists(copy)', 'true', 'corrections are not kept aside'),
        F('static_cast<void>(m_files.keepCopy(kept / name, scratch / name));', 'static_cast<void>(name);',
          'corrections that were kept aside do not come back')],
    'src/assembly/edited/OpenedRecords.cpp': [
        F('placeAtCentreIfUnset(edit, previewBox(*m_paper, orientationOf(*size)));', '', 'a picture that was never opened prints stretched'),
        F('line.editState.trimmed().isEmpty() ? EditRecord::newPicture() : line.editState', 'line.editState',
          'a blank record has no place')],
    'src/assembly/edited/EditedPrints.cpp': [F('edit.ToneFlag == 1', 'false', 'no copy is kept of a grey picture')],

    'src/transfer/ftp/FtpArrival.cpp': [
        F('!found || entry.length > found->length', 'true', 'of two lengths the last is believed',
          told='no server lists a name twice in one folder; a wrong length is asked for by SIZE'),
        F('found && found->there && *found->there != found->here', 'false', 'a part that lies there is never replaced'),
        F('found && found->there == found->here', 'found.has_value()', 'a part that lies there counts as whole'),
        F('found.there = asked;', '', 'SIZE does not overrule the listing')],
    'src/transfer/ftp/FtpFolderOwner.cpp': [
        F('order.ownsFolder(Sender::Ftp)', 'true', "two orders mix in one folder"),
        F('ours && *theirs == *ours ? Log::Same : Log::Other', 'Log::Same', 'the folder of another order counts as the own')],
    'src/transfer/ftp/FtpSession.cpp': [
        F('m_owner == Owner::Ours || m_owner == Owner::NotAsked', 'true', 'files go into the folder of another order'),
        F('m_putBegun || !m_lists.List4Broken.isEmpty() ? EmptyFolder::IsListed : EmptyFolder::MayBeRefused', 'EmptyFolder::MayBeRefused',
          'a refused listing hides what a cut put left'),
        F('m_lists.List4Broken.append(path);', '', 'a cut put is not removed'),
        F('mayGoOn(m_journal->take(path))', 'true', 'after a kill a part counts as the file')],
    'src/transfer/ftp/UploadCheck.cpp': [
        F('nothingBroken() || !m_freshListing', 'nothingBroken()', 'an old listing confirms that remains are gone', seen=True),
        F('unreadable = !m_session.unreadLine().isEmpty();', 'unreadable = false;', 'a listing that can not be read proves the order'),
        F('!ofRest || !ofRest->proven()', '!ofRest', 'a chosen part counts as the order'),
        F('!broken && !proof->missing.contains(name) && !proof->broken.contains(name)', '!proof->missing.contains(name)',
          'files of another length count as arrived'),
        F('nothingBroken() || !m_session.inOrderFolder()', 'nothingBroken()', 'files of another order are removed'),
        F('std::any_of(rest.begin(), rest.end(), [&](const QString& path) { return unconfirmed.contains(path); })', 'false',
          'a part that was never confirmed counts as arrived')],
    'src/transfer/ftp/UploadPass.cpp': [
        F('m_session.remove(name);', '', 'a server keeps the cut file'),
        F('m_skipped += lengthOf(path);', '', 'a long order that is mostly there is given up as too slow',
          told='what lies there is passed over in moments; the limit counts five minutes'),
        F('m_inHand.contains(path) && m_session.isWhole(path)', 'm_inHand.contains(path)', 'a part counts as whole when the sending goes on')],
    'src/transfer/ftp/FtpSender.cpp': [
        F('check.NumOnServer == NumToSend && !check.unreadable', 'check.NumOnServer == NumToSend', 'a count of an unreadable listing is believed'),
        F('verdict == Verdict::All && m_sender.check.freshCount', 'verdict == Verdict::All', 'a stop during the check reports the order', seen=True)],
    'src/transfer/delivery/OrderFiles.cpp': [
        F('name.compare(broken, Qt::CaseInsensitive) == 0', 'false', 'the list of broken files goes to the lab'),
        F('!inPieces || IsPiece(name)', 'true', 'an order in pieces goes whole too')],
    'src/transfer/delivery/SilenceLimit.cpp': [
        F('m_silentFiles >= mostSilentFiles || m_tooSlow', 'm_tooSlow', 'a dead server holds the customer for hours'),
        F('std::min<std::chrono::milliseconds>(running - *m_told, longestGap)', 'running - *m_told', 'a machine that slept ends the sending')],
    'src/transfer/delivery/PreparedAgain.cpp': [F('m_state = before;', '', 'after a failure the next order has choices of this one')],
    'src/transfer/delivery/Attempts.cpp': [F('attempt <= attempts', 'attempt < attempts', 'one attempt less')],
    'src/transfer/http/HttpArrival.cpp': [
        F('asks && ask(LeafName(path), there).length == *size', 'asks', 'a cut post counts as arrived'),
        F('proof.broken.contains(LeafName(path)) || proof.missing.contains(LeafName(path))', 'proof.missing.contains(LeafName(path))',
          'a file of another length counts as arrived')],
    'src/transfer/http/HttpFolderOwner.cpp': [F('theirs->body == *ours', 'true', 'two orders mix in one folder')],
    'src/transfer/http/HttpListGuard.cpp': [F('m_state.Careful ? ListMatch::Whole : ListMatch::Part', 'ListMatch::Part',
                                              'a name that holds another counts for it')],
    'src/transfer/http/HttpSender.cpp': [
        F('missing += m_arrival.remains(named, there);', '', 'a cut post that is listed counts as arrived'),
        F('m_arrival.postUnconfirmed(path);', '', 'a post without an answer is not looked at'),
        F('cut || m_script.refused()', 'cut', 'a post that the server refused counts as taken'),
        F('files.fileExists(list) ? files.removeFile(list) : Result<void>()', 'Result<void>()', 'a list of an earlier check is believed'),
        F('isKept(m_journal->folderIsAsked(Sender::Http))', 'true', 'after a kill the own folder counts as foreign')],
    'src/transfer/http/ServerList.cpp': [
        F('namesTotal(entry) || entry == folderName.toLower()', 'namesTotal(entry)', 'the name of the folder counts for the log'),
        F('given.trimmed().toLower()', 'given.trimmed()', 'a server that changes letters gets the order again and again'),
        F('encoded.replace(u"%"_s, u"%25"_s).replace(u"#"_s, u"%23"_s).replace(u"?"_s, u"%3F"_s)', 'encoded.replace(u"%"_s, u"%25"_s)',
          'a file with # in its name can not be looked up')],
    'src/transfer/http/UploadScript.cpp': [
        F('return body.append("--").append(boundary).append("--");', 'return body.append("--").append(boundary);', 'the script takes no file'),
        F('m_refused = !answer->good();', 'm_refused = false;', 'a post that the server refused counts as taken')],
    'src/transfer/report/ReportOnce.cpp': [
        F('!order.hasArrived() || m_state.transfer.SugMishloah == Sending::Chain', 'm_state.transfer.SugMishloah == Sending::Chain',
          'an order is told that has not arrived'),
        F('order.report == Report::Begun', 'false', 'the lab may be told twice'),
        F('m_state.profile.ReportOn > 0', 'true', 'a lab is told that wants no report'),
        F('(heard && done) || !m_state.Careful', 'true', 'a report that nobody heard counts as told'),
        F('isDue(by) && !m_journal.state().sentBefore', 'isDue(by)', 'an old order is told as new',
          told='an order of an older version alone, and a report prints nothing')],
    'src/transfer/report/InetForm.cpp': [F('u"c.txt"_s', 'u"c"_s', "the lab's site does not expect the report")],

    'src/finished/pieces/Mod4split.cpp': [
        F('*length / *segment + 1', '(*length + *segment - 1) / *segment', 'the total in the names is another'),
        F('!content.failed() && *taken != count', 'false', 'a file that shrinks while it is cut gives a short piece', seen=True),
        F('!IsPiece(path) || keys.contains(key)', 'keys.contains(key)', 'the sheet is joined as a piece'),
        F('declared == count', 'declared <= count', 'a family with a piece too many counts as whole')],
    'src/finished/mail/MailLetter.cpp': [F('details.n2', 'details.n1', 'the letter has no telephone')],
    'src/finished/mail/MailResult.cpp': [F('return 14;', 'return 3;', 'a wrong address is told as a missing server')],
    'src/finished/mail/PackageWalk.cpp': [F('fate != Fate::Sent', 'fate == Fate::Waiting', 'a package that failed is not tried again')],
    'src/finished/orders/MoogMeretWalk.cpp': [
        F('m_walksWholeOrder && m_walk.allSent()', 'm_walk.allSent()', 'a part sent by mail counts as the order'),
        F('outcome.end == MailEnd::Sent ? PackageWalk::Fate::Sent : PackageWalk::Fate::Failed', 'PackageWalk::Fate::Sent',
          'a package that failed counts as sent')],
    'src/start/hatchala.cpp': [F('m_state.KodMishloach = u"KUP"_s;', 'm_state.KodMishloach = u"KIN"_s;', 'the sheet tells another place')],
    'src/start/hatchalaOffer.cpp': [
        F('m_platform.instances.another()', 'false', 'an order under way in another window is offered',
          told='with Careful no second program runs; built in the number is claimed by its folder'),
        F('!asksToThrowAway(order.state.number) || m_leaving', 'm_leaving', 'an order is thrown away without a question'),
        F('order.gone > 0 && (!m_asksForGone || order.lacksAllPictures())', 'false', 'an order goes on without its pictures')],

    'src/order/CustomerTraces.cpp': [
        F('name != u"door"', 'true', 'pictures that an unfinished order needs go with the scratch files'),
        F('m_platform.shell.clearClipboard();', '', 'the clipboard is left to the next customer')],
    'src/order/KioskOffer.cpp': [
        F('digits.size() == telephoneEnd', 'true', 'no digit opens an order without a telephone'),
        F('now.phase == OrderState::Phase::Preparing', 'true', 'a prepared order is thrown away'),
        F('order.state.lapsed', 'false', 'an order is offered to whoever comes')],
    'src/kiosk/IdleWatch.cpp': [
        F('now() - m_since >= answerTime', 'true', 'the page goes as soon as the question has shown'),
        F('silence == Silence::MayNotEnd || silence == Silence::NeedsNone', 'silence == Silence::NeedsNone',
          'an order that is sent is cut')],
    'src/kiosk/KioskDays.cpp': [
        F('days >= 0 && days <= KioskDays::longestStep', 'days >= 0', 'a clock set to 2099 ages every order'),
        F('doubts < daysUntilBelieved', 'false', 'a clock that jumps is believed at once')],
    'src/kiosk/OrderKeeping.cpp': [
        F('order.proven', 'true', 'prints of an order go that is not proven'),
        F('!order.onlyReportIsLeft()', 'true', 'an order goes before the lab was told'),
        F('day < 0 || day > m_days.lived', 'false', 'a damaged store ages an order')],
    'src/kiosk/StaffCode.cpp': [
        F('keep(m_wrong + 1);', '', 'a wrong code costs nothing'),
        F('wrong > freeTries', 'wrong > freeTries + 1', 'the fifth wrong code costs nothing'),
        F('isNumber && wrong >= 0', 'true', 'a damaged store lets anybody try on')],

    'src/app/Program.cpp': [
        F('reading.deployment.Careful ? Instances::Lock::Exclusive : Instances::Lock::Shared', 'Instances::Lock::Shared',
          'two programs write one order'),
        F('!run.another()', 'true', 'files that another program is writing go',
          told='without Careful two programs may share a folder; a write that loses its hidden file fails, and is told')],
    'src/views/MoogMeret/MoogMeretView.cpp': [F('&MoogMeret::Command4_Click', '&MoogMeret::Command2_Click', 'the button that sends mails')],
    'src/views/kyoskNew/kyoskNewView.cpp': [
        F('m_page.Command13_Click(i);', 'm_page.Command12_Click(i);', 'minus adds a copy'),
        F('m_next->click();', '', 'the key for the next page does nothing', seen=True),
        F('look.copies = c.Label4[i].text;', '', 'a cell shows no copies',
          told='the order and the sum below the pages are right')],
    'src/views/kyoskNew/PictureCell.cpp': [F('m_plus->click();', 'm_minus->click();', 'the key + takes a copy away')],
    'src/views/sending/FtpFrmView.cpp': [
        F('&FtpFrm::Command15_Click', '&FtpFrm::Command11_Click', 'the button that stops does not', seen=True),
        F('&FtpFrm::Command10_Click', '&FtpFrm::Command15_Click', 'an order can not be sent again', seen=True),
        F('m_leave->setOpen(c.Picture7.visible);', '', 'the question before leaving is not shown')],
    'src/views/window/PageView.cpp': [
        F('widget->setEnabled(caption.enabled);', 'widget->setEnabled(true);', 'buttons can be pressed out of turn'),
        F('main->click();', '', 'Enter in a box does nothing'),
        F('check->setChecked(static_cast<const CheckCaption&>(caption).checked);', '', 'a mark shows another state than the order has')],
    'src/views/kit/Keyboard.cpp': [F('button->click();', '', 'Enter on a button does nothing', seen=True)],
    'src/views/kit/CaptionField.cpp': [F("type(u'\\b');", '', 'a caption can not be taken back')],
    'src/views/kit/ChoiceCards.cpp': [F('row == current', 'false', 'the chosen paper is not shown')],
    'src/views/kit/TouchKeyboard.cpp': [
        F('m_capitals ? small.toUpper() : small', 'small', 'no name on the screen begins with a large letter')],
    'src/views/window/FieldKeyboard.cpp': [
        F('lowest - m_keys->y()', '0', 'the field lies behind the keys'),
        F('line->echoMode() != QLineEdit::Normal', 'false', 'keys rise for what is hidden'),
        F('before.back().isSpace()', 'false', 'a second name begins small'),
        F('field && field == touched', 'field != nullptr', 'keys rise where nobody has touched')],
    'src/views/window/PressFilter.cpp': [
        F('away.manhattanLength() > samePlace', 'true', 'the second half of a doubled touch types a letter'),
        F('rule.seen();', '', 'who types fast loses letters')],
    'src/selection/CopiesEntry.cpp': [
        F('copies <= PrintCode::mostCopies', 'true', 'a hundred copies are ordered'),
        F('m_begun ? m_text.toInt() : 0', 'm_text.toInt()', 'a 5 behind the 1 that stood there orders 15')],
}
