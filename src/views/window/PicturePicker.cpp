#include "views/window/PicturePicker.h"

#include "common/AnsiCodePage.h"
#include "common/PictureName.h"
#include "common/Warning.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "selection/CardWords.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"
#include "views/kit/CardOffer.h"
#include "views/kit/ElidedLabel.h"
#include "views/kit/Painting.h"
#include "views/kit/ScreenReader.h"

#include <QDateTime>
#include <QFileInfo>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QStandardPaths>
#include <QStyledItemDelegate>

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

enum ItemRole { PathRole = Qt::UserRole, FolderRole, PictureRole, PlainRole, BrokenRole, HeadingRole };

// One cell of the grid: the picture or the folder's sign, and the name below it.
class CellPainter : public QStyledItemDelegate {
public:
    CellPainter(const Theme& theme, QObject* parent)
        : QStyledItemDelegate(parent)
        , m_theme(theme) {}

    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override {
        const auto* view = qobject_cast<const QAbstractItemView*>(option.widget);
        if (view && index.data(HeadingRole).toBool())
            return {view->viewport()->width() - 1, m_theme.px(40)};
        return {m_theme.px(160), m_theme.px(172)};
    }

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override {
        painter->save();
        painter->setLayoutDirection(option.widget->parentWidget()->layoutDirection());
        if (index.data(HeadingRole).toBool()) {
            const int inset = m_theme.size(Space::Small);
            painter->setFont(m_theme.font(Theme::Type::Strong));
            painter->setPen(Theme::Colour::Ink);
            painter->drawText(option.rect.adjusted(inset, 0, -inset, -m_theme.size(Space::Tight)),
                              Qt::AlignBottom | Qt::AlignLeft, index.data(Qt::DisplayRole).toString());
            painter->restore();
            return;
        }
        const bool chosen = option.state & QStyle::State_Selected;
        const bool focused = option.state & QStyle::State_HasFocus;
        const int inset = m_theme.size(Space::Tight);
        const QRectF cell = drawCard(*painter, option.rect.adjusted(inset, inset, -inset, -inset),
                                     chosen    ? Theme::Colour::Primary
                                     : focused ? Theme::Colour::Focus
                                               : Theme::Colour::Line,
                                     chosen ? Theme::Colour::PrimarySoft : Theme::Colour::Surface,
                                     chosen || focused ? m_theme.thick() : m_theme.edge(), m_theme.corner());
        const QRectF box = cell.adjusted(m_theme.size(Space::Small), m_theme.size(Space::Small),
                                         -m_theme.size(Space::Small), -m_theme.px(36));
        const QImage picture = index.data(PictureRole).value<QImage>();
        if (!picture.isNull()) {
            drawImage(*painter, box, picture);
        } else {
            const bool folder = index.data(FolderRole).toBool();
            const QString broken = index.data(BrokenRole).toString();
            const QString icon = folder                           ? u"folder"_s
                                 : index.data(PlainRole).toBool() ? u"document"_s
                                 : !broken.isEmpty()              ? u"warning"_s
                                                                  : u"picture"_s;
            const int side = folder ? m_theme.px(68) : m_theme.size(IconSize::Box);
            const QRectF words = broken.isEmpty() ? QRectF() : box.adjusted(0, box.height() / 2, 0, 0);
            drawIcon(*painter, box.center() - QPointF(0, words.height() / 2),
                     m_theme.icon(icon, side, folder ? Theme::Colour::Primary : Theme::Colour::Muted));
            painter->setFont(m_theme.font(Theme::Type::Small));
            painter->setPen(Theme::Colour::Muted);
            painter->drawText(words, Qt::AlignCenter | Qt::TextWordWrap, broken);
        }
        painter->setFont(m_theme.font(Theme::Type::Small));
        painter->setPen(Theme::Colour::Ink);
        const QRectF line(cell.left() + m_theme.size(Space::Small), cell.bottom() - m_theme.px(32),
                          cell.width() - m_theme.size(Space::Small) * 2, m_theme.px(26));
        const QString name = painter->fontMetrics().elidedText(index.data(Qt::DisplayRole).toString(), Qt::ElideMiddle,
                                                               static_cast<int>(line.width()));
        painter->drawText(line, Qt::AlignCenter, fromLeft(name));
        painter->restore();
    }

private:
    const Theme& m_theme;
};

// Enter takes what is chosen, Backspace goes up.
class Grid : public QListWidget {
public:
    using QListWidget::QListWidget;
    std::function<void()> up;

protected:
    void keyPressEvent(QKeyEvent* event) override {
        if (event->key() == Qt::Key_Backspace)
            up();
        else if ((event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter) && currentItem())
            Q_EMIT itemActivated(currentItem());
        else if (event->key() == Qt::Key_Escape)
            event->ignore();
        else
            QListWidget::keyPressEvent(event);
    }

    // The first click of the two may have opened a folder; the second is not meant for what lies there now.
    void mouseDoubleClickEvent(QMouseEvent* event) override {
        const QListWidgetItem* item = itemAt(event->position().toPoint());
        if (item && item->isSelected())
            QListWidget::mouseDoubleClickEvent(event);
    }
};

QString leafOf(const HostPath& path) {
    return toText(path.filename());
}

// A text without the room for one line has two. Each stands off from a sign.
QString inLines(const QString& text, const QFontMetrics& metrics, int room) {
    QStringList lines = metrics.horizontalAdvance(text) > room ? inTwoLines(text) : QStringList(text);
    for (QString& line : lines)
        line = QChar(0xA0) + metrics.elidedText(line, Qt::ElideRight, room);
    return lines.join(u'\n');
}

// The picker opens at the first place that holds anything, not at the last folder: that may be another customer's.
bool holdsAnything(const HostPath& folder) {
    std::error_code error;
    std::filesystem::directory_iterator at(folder, std::filesystem::directory_options::skip_permission_denied, error);
    return !error && at != std::filesystem::directory_iterator();
}

} // namespace

PicturePicker::PicturePicker(const Theme& theme, QWidget* parent, const SessionState& state, const Platform& platform,
                             const QString& prompt, const DrivePath& initialFolder, const QString& title,
                             Dialogs::Offer offer)
    : Overlay(theme, parent)
    , m_theme(theme)
    , m_state(state)
    , m_files(platform.files)
    , m_cards(platform.cards)
    , m_clock(platform.clock)
    , m_offer(offer)
    , m_pictures(platform.doorProgram, state.door, static_cast<int>(theme.size(Extent::Field) * devicePixelRatioF())) {
    setObjectName(u"picturePicker"_s);
    setAccessibleName(title.isEmpty() ? prompt : title);
    setFilling();
    const auto named = [](QLabel* label, const QString& name) {
        label->setObjectName(name);
        return label;
    };
    const QString guide =
        everyFile()
            ? state.wording(u"לחיצה פותחת תיקייה ובוחרת קובץ"_s, u"A press opens a folder and chooses a file"_s)
            : state.wording(u"יש לבחור רק תמונה אחת מתוך תקייה והתוכנה תציג לפניך את כל התמונות"_s,
                            u"Select only one image of a folder and the program will show you all the images"_s);
    add(*column(), {named(words("title", isolated(prompt.trimmed())), u"pickerPrompt"_s),
                    named(words("muted", isolated(guide)), u"pickerGuide"_s)});
    if (watchesCards())
        addRow({makeCardRow()}, Space::Normal);
    m_places = places(initialFolder);
    QLayout* side = makePlaces();
    m_up = wordButton(u"pickerUp"_s, "plain", state.wording(u"תיקייה מעל"_s, u"Folder above"_s),
                      [this] { open(m_folder.parent_path()); });
    setButtonIcon(m_up, theme, u"folder-up"_s, Theme::Colour::Ink);
    m_where = new ElidedLabel("strong", this);
    makeGrid();
    addRow({side, {inColumn(Space::Small, {inRow(Space::Normal, {m_up, {m_where, 1}}), {m_grid, 1}}), 1}}, Space::Far);
    column()->setStretch(column()->count() - 1, 1);
    const auto cancel = [this] { Q_EMIT finished({}); };
    QPushButton* back = wordButton(u"pickerCancel"_s, "secondary", state.wording(u"ביטול"_s, u"Cancel"_s), cancel);
    m_take = wordButton(u"pickerTake"_s, "main",
                        everyFile() ? state.wording(u"בחר קובץ זה"_s, u"Take this file"_s)
                                    : state.wording(u"בחר תמונה זו"_s, u"Take this picture"_s),
                        [this] { take(); });
    addButtons(back, m_take);
    whenEscaped(cancel);
    setFirstFocus(m_grid);
    connect(&m_pictures, &ListPictures::done, this, &PicturePicker::showPicture);
    open(firstFolder(initialFolder));
}

QLayout* PicturePicker::makePlaces() {
    m_side = inColumn(
        Space::Small,
        {words("smallMuted", everyFile() ? m_state.wording(u"היכן הקבצים?"_s, u"Where are the files?"_s)
                                         : m_state.wording(u"היכן התמונות?"_s, u"Where are the pictures?"_s))});
    m_side->addStretch(1);
    for (std::size_t i = 0; i < m_places.size(); ++i)
        addPlaceButton(i);
    showPlaceNames();
    return m_side;
}

void PicturePicker::addPlaceButton(std::size_t i) {
    const Place& place = m_places[i];
    QPushButton* button =
        wordButton(u"place(%1)"_s.arg(i), "tall", place.words, [this, i] { open(startOf(m_places[i].folder)); });
    setButtonIcon(button, m_theme, place.icon, Theme::Colour::Primary);
    button->setProperty("folder", toText(place.folder));
    button->setCheckable(true);
    excludeOthers(*button);
    button->setFixedWidth(m_theme.size(Extent::WideField));
    m_placeButtons.push_back(button);
    m_side->insertWidget(m_side->count() - 1, button); // above the stretch
}

// A card that came later is added below the others, so that no place moves below a finger.
void PicturePicker::joinPlaces(const std::vector<Cards::Card>& cards) {
    for (Place& place : m_places) {
        if (!place.label.isEmpty()) // its kind may be known by now
            place = placeOf(place.folder, m_cards.all(), m_state.english());
    }
    for (const Cards::Card& card : cards) {
        const HostPath& folder = card.medium.folder;
        const auto isIt = [&](const Place& place) { return place.folder == folder; };
        if (!card.summary || !isOpenTo(folder) || std::any_of(m_places.begin(), m_places.end(), isIt))
            continue;
        m_places.push_back(placeOf(folder, cards, m_state.english()));
        addPlaceButton(m_places.size() - 1);
    }
    showPlaceNames();
    m_where->setWhole(whereIs(m_folder, m_places));
}

void PicturePicker::showPlaceNames() {
    for (std::size_t i = 0; i < m_placeButtons.size(); ++i) {
        QPushButton* button = m_placeButtons[i];
        const QString name = nameOf(m_places[i], m_places);
        button->ensurePolished();
        const int room = m_theme.size(Extent::WideField) - m_theme.px(56); // beside its sign
        button->setText(inLines(name, button->fontMetrics(), room).replace(u'&', u"&&"_s));
        button->setAccessibleName(name);
    }
}

QPushButton* PicturePicker::wordButton(const QString& name, const char* role, const QString& text,
                                       std::function<void()> clicked) const {
    QPushButton* button = plainButton(name, role, std::move(clicked));
    button->setText(text);
    button->setAccessibleName(text);
    return button;
}

void PicturePicker::makeGrid() {
    auto* grid = new Grid(this);
    grid->up = [this] { m_up->click(); };
    m_grid = grid;
    m_grid->setObjectName(u"pickerGrid"_s);
    m_grid->setAccessibleName(everyFile() ? m_state.wording(u"תיקיות וקבצים"_s, u"Folders and files"_s)
                                          : m_state.wording(u"תיקיות ותמונות"_s, u"Folders and pictures"_s));
    m_grid->setItemDelegate(new CellPainter(m_theme, m_grid));
    m_grid->setViewMode(QListView::IconMode);
    m_grid->setMovement(QListView::Static);
    m_grid->setResizeMode(QListView::Adjust);
    m_grid->setUniformItemSizes(!watchesCards()); // a heading takes a row
    m_grid->setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_grid->setProperty("ownRing", true);
    // As the small pictures of the page run.
    m_grid->setLayoutDirection(Qt::LeftToRight);
    connect(m_grid, &QListWidget::itemDoubleClicked, this, &PicturePicker::activate);
    connect(m_grid, &QListWidget::itemActivated, this, &PicturePicker::activate);
    connect(m_grid, &QListWidget::itemClicked, this, [this](const QListWidgetItem* item) {
        if (item->data(FolderRole).toBool())
            activate(item); // one touch opens a folder
    });
    connect(m_grid, &QListWidget::itemSelectionChanged, this, [this] {
        const QListWidgetItem* item = m_grid->currentItem();
        m_take->setEnabled(item && item->isSelected() && !item->data(FolderRole).toBool());
    });
    m_empty = centred(words("muted"));
    m_empty->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_empty->setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    m_grid->setLayout(inColumn(Space::None, {m_empty}));
}

bool PicturePicker::isOpenTo(const HostPath& path) const {
    return !m_state.closedToCustomers() || CustomersMedia(m_files.drives()).hold(path);
}

HostPath PicturePicker::firstFolder(const DrivePath& initialFolder) const {
    if (m_places.empty())
        return {};
    std::error_code absent;
    if (const auto initial = m_files.drives().toHost(initialFolder);
        everyFile() && initial && isOpenTo(*initial) && std::filesystem::is_directory(*initial, absent))
        return *initial;
    const auto first =
        std::find_if(m_places.begin(), m_places.end(), [](const Place& place) { return holdsAnything(place.folder); });
    return startOf((first != m_places.end() ? *first : m_places.front()).folder);
}

// A card opens at its newest folder.
HostPath PicturePicker::startOf(const HostPath& place) const {
    for (const Cards::Card& card : m_cards.all()) {
        if (watchesCards() && card.medium.folder == place && card.summary && card.summary->pictures > 0)
            return card.summary->newestFolder;
    }
    return place;
}

QLayout* PicturePicker::makeCardRow() {
    QHBoxLayout* row = inRow(Space::Normal);
    for (std::size_t i = 0; i < m_cardSlots.size(); ++i) {
        auto* tile = new CardOffer(m_theme, this, CardOffer::Size::Large);
        tile->setObjectName(u"card(%1)"_s.arg(i));
        if (i < 2) // a third is rare, and takes its room when it comes
            keepPlaceWhenHidden(*tile);
        connect(tile, &QAbstractButton::clicked, this, [this, i] { openCard(i); });
        m_cardSlots[i].tile = tile;
        row->addWidget(tile, 1);
    }
    m_watch.emplace(m_cards);
    connect(&m_cards, &Cards::changed, this, &PicturePicker::showCards);
    showCards();
    return row;
}

void PicturePicker::showCards() {
    const std::vector<Cards::Card> cards = m_cards.all();
    const auto find = [&](const QString& medium) {
        return std::find_if(cards.begin(), cards.end(),
                            [&](const Cards::Card& card) { return card.medium.id == medium; });
    };
    for (CardSlot& slot : m_cardSlots) {
        if (find(slot.medium) == cards.end())
            slot = {slot.tile, {}, {}};
    }
    for (const Cards::Card& card : cards) {
        const auto has = [](const QString& medium) {
            return [medium](const CardSlot& slot) { return slot.medium == medium; };
        };
        if (std::any_of(m_cardSlots.begin(), m_cardSlots.end(), has(card.medium.id)))
            continue;
        const auto empty = std::find_if(m_cardSlots.begin(), m_cardSlots.end(), has({}));
        if (empty != m_cardSlots.end())
            empty->medium = card.medium.id;
    }
    const auto isUsed = [](const CardSlot& slot) { return !slot.medium.isEmpty(); };
    const bool many = std::count_if(m_cardSlots.begin(), m_cardSlots.end(), isUsed) > 2;
    for (CardSlot& slot : m_cardSlots) {
        const auto card = find(slot.medium);
        const bool in = card != cards.end();
        const CardWords words =
            in ? cardWords(*card, m_clock.now().date(), m_state.english()) : noCardWords(m_state.english());
        slot.picture = words.opens ? card->summary->newestPicture : HostPath();
        slot.tile->setSize(many ? CardOffer::Size::Slim : CardOffer::Size::Large);
        slot.tile->setVisible(in || &slot == &m_cardSlots.front());
        slot.tile->setEnabled(words.opens);
        const bool isOneOfSeveral = std::count_if(cards.begin(), cards.end(), [&](const Cards::Card& other) {
                                        return mediumWords(other.medium, m_state.english()) == words.head;
                                    }) > 1;
        const QString head = in && isOneOfSeveral ? withLabel(words.head, card->medium.label) : words.head;
        slot.tile->setText(head);
        slot.tile->setNote(words.note);
        slot.tile->setAccessibleName(words.note.isEmpty() ? head : head + u", "_s + words.note);
    }
    if (m_side)
        joinPlaces(cards);
}

void PicturePicker::openCard(std::size_t slot) {
    if (!m_cardSlots[slot].picture.empty())
        Q_EMIT finished(pathText(m_cardSlots[slot].picture));
}

std::vector<Place> PicturePicker::places(const DrivePath& initialFolder) const {
    std::vector<Place> result;
    const auto addPlace = [&](const Place& place) {
        std::error_code error;
        const bool known =
            std::any_of(result.begin(), result.end(), [&](const Place& other) { return other.folder == place.folder; });
        if (!place.folder.empty() && !known && std::filesystem::is_directory(place.folder, error))
            result.push_back(place);
    };
    const auto add = [&](const QString& words, const QString& icon, const HostPath& folder) {
        addPlace({words, icon, folder});
    };
    const QString ofProgram = m_state.wording(u"תיקיית התוכנה"_s, u"The program's folder"_s);
    const auto addDrive = [&](const Drives::Drive& drive) {
        if (drive.removable)
            addPlace(placeOf(drive.folder, m_cards.all(), m_state.english()));
        else
            add(drive.folder == "/" ? m_state.wording(u"כל המחשב"_s, u"This computer"_s) : ofProgram, u"drive"_s,
                drive.folder);
    };
    if (m_state.closedToCustomers()) {
        const CustomersMedia media(m_files.drives());
        for (const Drives::Drive& medium : media.all())
            addDrive(medium);
        return result;
    }
    const auto drives = m_files.drives().drives();
    for (const Drives::Drive& drive : drives) {
        if (drive.removable || drive.offeredFirst)
            addDrive(drive);
    }
    const auto standard = [](QStandardPaths::StandardLocation where) {
        return toHostPath(QStandardPaths::writableLocation(where));
    };
    add(m_state.wording(u"התמונות במחשב זה"_s, u"This computer's pictures"_s), u"pictures"_s,
        standard(QStandardPaths::PicturesLocation));
    add(m_state.wording(u"שולחן העבודה"_s, u"Desktop"_s), u"picture"_s, standard(QStandardPaths::DesktopLocation));
    add(m_state.wording(u"הורדות"_s, u"Downloads"_s), u"folder"_s, standard(QStandardPaths::DownloadLocation));
    add(m_state.wording(u"תיקיית הבית"_s, u"Home folder"_s), u"home"_s, standard(QStandardPaths::HomeLocation));
    if (const auto initial = m_files.drives().toHost(initialFolder))
        add(everyFile() ? m_state.wording(u"התיקייה הנוכחית"_s, u"This folder"_s) : ofProgram,
            everyFile() ? u"folder"_s : u"drive"_s, *initial);
    for (const Drives::Drive& drive : drives)
        addDrive(drive);
    if (result.empty())
        add(m_state.wording(u"כל המחשב"_s, u"This computer"_s), u"drive"_s, "/");
    return result;
}

void PicturePicker::open(const HostPath& folder) {
    m_folder = folder;
    m_pictures.stop();
    m_inHand = 0;
    m_unread.clear();
    m_grid->clear();
    m_take->setEnabled(false);
    m_up->setEnabled(folder.has_relative_path() && isOpenTo(folder.parent_path()));
    for (QPushButton* button : m_placeButtons)
        button->setChecked(false);
    for (std::size_t i = 0; i < m_places.size(); ++i) {
        if (m_places[i].folder == folder)
            m_placeButtons[i]->setChecked(true);
    }
    m_where->setWhole(whereIs(folder, m_places));

    std::vector<HostPath> folders;
    std::vector<HostPath> files;
    std::error_code error;
    std::filesystem::directory_iterator at;
    if (isOpenTo(folder))
        at = std::filesystem::directory_iterator(folder, error);
    for (; !error && at != std::filesystem::directory_iterator(); at.increment(error)) {
        const HostPath& path = at->path();
        std::error_code kind;
        if (leafOf(path).startsWith(u'.') || (at->is_symlink(kind) && !isOpenTo(path)))
            continue;
        if (at->is_directory(kind))
            folders.push_back(path);
        else if ((everyFile() || isPicture(path)) && at->is_regular_file(kind))
            files.push_back(path);
    }
    const auto byName = [](const HostPath& a, const HostPath& b) {
        return leafOf(a).compare(leafOf(b), Qt::CaseInsensitive) < 0;
    };
    std::sort(folders.begin(), folders.end(), byName);
    std::sort(files.begin(), files.end(), byName);
    for (const HostPath& path : folders)
        addPicture(path, true);
    if (watchesCards()) {
        addByDays(files);
    } else {
        for (const HostPath& path : files)
            addPicture(path, false);
    }
    m_empty->setVisible(m_grid->count() == 0);
    m_empty->setText(m_places.empty() ? m_state.wording(u"נא להכניס כרטיס זיכרון או זיכרון נייד למכשיר."_s,
                                                        u"Please put your memory card or stick into the machine."_s)
                     : error ? m_state.wording(u"אין אפשרות לפתוח תיקייה זו. נא לבחור מקום אחר."_s,
                                               u"This folder can't be opened. Choose another place."_s)
                     : everyFile() ? m_state.wording(u"אין כאן קבצים. נא לבחור מקום אחר."_s,
                                                     u"There are no files here. Choose another place."_s)
                                   : m_state.wording(u"אין כאן תמונות. נא לבחור מקום אחר."_s,
                                                     u"There are no pictures here. Choose another place."_s));
    if (m_grid->count() > 0)
        m_grid->setCurrentRow(m_grid->item(0)->data(HeadingRole).toBool() ? 1 : 0, QItemSelectionModel::NoUpdate);
    readNext();
}

bool PicturePicker::isPicture(const HostPath& path) const {
    return isPictureFile(leafOf(path), m_state.door.everyFormat);
}

void PicturePicker::addPicture(const HostPath& path, bool isFolder) {
    auto* item = new QListWidgetItem(leafOf(path), m_grid);
    item->setData(PathRole, QByteArray::fromStdString(path.string()));
    item->setData(FolderRole, isFolder);
    item->setToolTip(leafOf(path));
    item->setData(PlainRole, !isFolder && !isPicture(path));
    if (!isFolder && isPicture(path))
        m_unread.push_back(m_grid->row(item));
}

void PicturePicker::addHeading(const QString& words) {
    auto* item = new QListWidgetItem(words, m_grid);
    item->setData(HeadingRole, true);
    item->setFlags(Qt::NoItemFlags);
}

// By the times of the files, the newest day and picture first; the files come sorted by name.
void PicturePicker::addByDays(const std::vector<HostPath>& files) {
    std::vector<std::pair<QDateTime, HostPath>> timed;
    timed.reserve(files.size());
    for (const HostPath& file : files)
        timed.emplace_back(QFileInfo(toText(file)).lastModified(), file);
    std::stable_sort(timed.begin(), timed.end(), [](const auto& a, const auto& b) { return a.first > b.first; });
    std::optional<QDate> day;
    for (const auto& [time, file] : timed) {
        if (day != time.date()) {
            day = time.date();
            addHeading(dayWords(*day, m_clock.now().date(), m_state.english()));
        }
        addPicture(file, false);
    }
}

// Some at a time, so that a slow one does not hold those behind it.
void PicturePicker::readNext() {
    while (m_inHand < ListPictures::atATime && !m_unread.empty()) {
        const auto next = nextUnread();
        const int row = *next;
        m_unread.erase(next);
        ++m_inHand;
        m_pictures.read(row, HostPath(m_grid->item(row)->data(PathRole).toByteArray().toStdString()));
    }
}

// The rows in view are read first.
std::deque<int>::const_iterator PicturePicker::nextUnread() const {
    const QRect seen = m_grid->viewport()->rect();
    for (auto at = m_unread.begin(); at != m_unread.end(); ++at) {
        const QRect cell = m_grid->visualItemRect(m_grid->item(*at));
        if (cell.intersects(seen))
            return at;
        if (cell.top() > seen.bottom())
            break;
    }
    return m_unread.begin();
}

void PicturePicker::showPicture(int row, const Result<Bitmap>& picture) {
    --m_inHand;
    QListWidgetItem* item = m_grid->item(row);
    if (picture)
        item->setData(PictureRole, picture->image());
    else
        showUnread(*item, picture.failure());
    readNext();
}

// Where the machine lacks a program the picture may be as good as any, and can be chosen.
void PicturePicker::showUnread(QListWidgetItem& item, const Failure& why) {
    if (why.kind == Failure::Kind::NoProgram) {
        if (!std::exchange(m_toldStaff, true))
            writeWarning(why.message);
        return;
    }
    const HostPath file(item.data(PathRole).toByteArray().toStdString());
    const QString words = warnedWords(m_state, why, DrivePath(pathText(file)));
    item.setData(BrokenRole, words);
    item.setData(Qt::AccessibleTextRole, QString(item.text() + u", "_s + words));
}

void PicturePicker::activate(const QListWidgetItem* item) {
    const HostPath path(item->data(PathRole).toByteArray().toStdString());
    if (item->data(FolderRole).toBool())
        open(path);
    else
        Q_EMIT finished(pathText(path));
}

// Behind the door any name can be ordered.
QString PicturePicker::pathText(const HostPath& path) const {
    const QString text = m_files.drives().toDrive(path).text();
    return m_state.door.any() && !everyFile() ? text : AnsiCodePage::squeeze(text);
}

void PicturePicker::take() {
    if (const QListWidgetItem* item = m_grid->currentItem())
        activate(item);
}

} // namespace lumora
