#pragma once

#include "platform/Dialogs.h"
#include "platform/files/CustomersMedia.h"
#include "platform/files/HostPath.h"
#include "platform/media/Cards.h"
#include "selection/PlaceNames.h"
#include "selection/door/ListPictures.h"
#include "views/kit/Overlay.h"

#include <QListWidget>

#include <array>
#include <deque>
#include <optional>
#include <vector>

namespace lumora {

class CardOffer;
class Clock;
class ElidedLabel;
class Files;
struct Platform;
struct SessionState;

// The picker of one picture: the places at the side, memory cards first, and a grid of the folders and pictures of the
// place that is open. A click chooses, a double click or Enter takes it. Small pictures are read in the background,
// some at a time, those in view first, so that a folder of thousands opens at once. Where every file is on offer, other
// files show by a sign. Where the lab has cards watched, those that are in stand above, and pictures stand by days.
class PicturePicker : public Overlay {
    Q_OBJECT
public:
    // The picker opens at initialFolder when no better place is known.
    PicturePicker(const Theme& theme, QWidget* parent, const SessionState& state, const Platform& platform,
                  const QString& prompt, const DrivePath& initialFolder, const QString& title, Dialogs::Offer offer);

Q_SIGNALS:
    // The drive path of the picture as the code page has it ("?" for what it lacks); empty for a cancel.
    void finished(const QString& drivePath);

private:
    bool everyFile() const { return m_offer == Dialogs::Offer::EveryFile; }
    std::vector<Place> places(const DrivePath& initialFolder) const;
    // On a kiosk a customer sees cards and sticks alone; one that came since is among them.
    bool isOpenTo(const HostPath& path) const;
    HostPath firstFolder(const DrivePath& initialFolder) const;
    bool watchesCards() const { return !everyFile() && m_cards.areWatched(); }
    HostPath startOf(const HostPath& place) const;
    QLayout* makeCardRow();
    void showCards();
    void openCard(std::size_t slot);
    void addHeading(const QString& words);
    void addPicture(const HostPath& path, bool isFolder);
    void addByDays(const std::vector<HostPath>& files);
    QLayout* makePlaces();
    void addPlaceButton(std::size_t place);
    void showPlaceNames();
    void joinPlaces(const std::vector<Cards::Card>& cards);
    void makeGrid();
    QPushButton* wordButton(const QString& name, const char* role, const QString& text,
                            std::function<void()> clicked) const;
    void open(const HostPath& folder);
    void activate(const QListWidgetItem* item);
    void take();
    void readNext();
    std::deque<int>::const_iterator nextUnread() const;
    void showUnread(QListWidgetItem& item, const Failure& why);
    void showPicture(int row, const Result<Bitmap>& picture);
    bool isPicture(const HostPath& path) const;
    QString pathText(const HostPath& path) const;

    const Theme& m_theme;
    const SessionState& m_state;
    const Files& m_files;
    Cards& m_cards;
    const Clock& m_clock;
    const Dialogs::Offer m_offer;
    // A card keeps its place while it is in, so that no tile moves below a finger.
    struct CardSlot {
        CardOffer* tile = nullptr;
        QString medium;
        HostPath picture; // the newest, empty when none can be opened
    };
    std::array<CardSlot, 3> m_cardSlots;
    std::optional<Cards::Watch> m_watch;
    std::vector<Place> m_places;
    std::vector<QPushButton*> m_placeButtons;
    QVBoxLayout* m_side = nullptr;
    HostPath m_folder;
    ElidedLabel* m_where;
    QLabel* m_empty;
    QPushButton* m_up;
    QPushButton* m_take;
    QListWidget* m_grid;
    ListPictures m_pictures;
    int m_inHand = 0;         // small pictures that are being read
    bool m_toldStaff = false; // that the program is missing which reads them
    std::deque<int> m_unread; // rows whose small picture is still to be read
};

} // namespace lumora
