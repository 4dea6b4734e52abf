#pragma once

#include "finished/pieces/Mod4split.h"
#include "platform/files/Files.h"
#include "session/Caption.h"
#include "session/Page.h"

#include <optional>

namespace lumora {

class PageChain;
struct Platform;
struct SessionState;

struct SpltFormControls : Controls {
    Caption Title{*this, u"Title"};

    Caption Label4Cut{*this, u"Label4Cut"}; // heading of the files to cut
    Caption Command2{*this, u"Command2"};   // choose the folder of the files to cut
    Caption Label4files{*this, u"Label4files"};
    TextList List4files{*this, u"List4files"}; // files to cut, full paths
    Caption Label4Text2{*this, u"Label4Text2"};
    Caption Text2{*this, u"Text2"};       // size of a piece in bytes, as typed
    Caption Command3{*this, u"Command3"}; // "Split All"
    Caption Command9{*this, u"Command9"}; // "splitOne"

    Caption Label4Join{*this, u"Label4Join"};     // heading of the pieces to join
    Caption Command8{*this, u"Command8"};         // read a folder of pieces
    Caption Label1{*this, u"Label1"};             // count of ListChalakim
    Caption Label5{*this, u"Label5"};             // count of List4Bodedim
    Caption Label4Counts{*this, u"Label4Counts"}; // both counts in words; empty until a folder is read
    Caption Label4Bodedim{*this, u"Label4Bodedim"};
    TextList List4Bodedim{*this, u"List4Bodedim"}; // the first listed piece of each family
    Caption Label4Famely{*this, u"Label4Famely"};
    TextList List4Famely{*this, u"List4Famely"}; // the pieces of the present family
    Caption Label4Chalakim{*this, u"Label4Chalakim"};
    TextList ListChalakim{*this, u"ListChalakim"};             // all files of the folders read so far, full paths
    Caption Label8{*this, u"Label8"};                          // length of the chosen file in bytes
    Caption Label9{*this, u"Label9"};                          // drive of the chosen file, "C:"
    Caption Label4Length{*this, u"Label4Length"};              // length and drive in words; empty until asked for
    Caption Command1{*this, u"Command1"};                      // "MergeAll"
    Caption Command4{*this, u"Command4"};                      // "Merge"
    Caption Command5{*this, u"Command5", Caption::At::Hidden}; // "Find Famely"; has no effect
    Caption Command6{*this, u"Command6"};                      // "Filelen"

    Caption Label4Idle{*this, u"Label4Idle"};   // what the page is for
    Caption Label4Work{*this, u"Label4Work"};   // what the present work does
    Caption Label4Total{*this, u"Label4Total"}; // result of the work
    Caption Label4Where{*this, u"Label4Where"}; // folder of the result
    Caption Command15{*this, u"Command15"};     // stop
    Caption Image3{*this, u"Image3"};           // back
};

// The page of pieces ("SpltForm" in the glossary): the lab's operator cuts the files of a folder into pieces for a slow
// connection, and joins families of pieces into files again. It works on any folder and writes beside the sources. Long
// work pumps events after each piece and can be stopped there.
class SpltForm : public Page, private SpltFormControls {
    Q_OBJECT
public:
    SpltForm(const SessionState& state, const Platform& platform, PageChain& chain);

    void setTexts() override;

    // --- events ---

    void Text2_Change(const QString& text) { typeSize(text); }
    void Command2_Click() { chooseFilesToCut(); }
    void Command3_Click() { cutAll(); }
    void Command9_Click() { cutOne(); }
    void Command8_Click() { addPieces(); }
    void Command1_Click() { joinAll(); }
    void Command4_Click() { joinChosen(); }
    void Command6_Click() { showLengthOfChosen(); }
    void List4Bodedim_Click(int index) { chooseFamily(index); }
    void ListChalakim_Click(int index) { choosePiece(index); }
    void Command15_Click() { stopWork(); }
    void Image3_Click() { goBack(); } // stops the work first

    // --- state ---

    enum class Phase { Idle, Working, Good, Partly, Failed }; // the last three are results
    Phase phase() const { return m_phase; }
    const SpltFormControls& controls() const override { return *this; }
    int percent() const { return m_percent; } // of the present work
    // An entry of List4Bodedim as the list shows it.
    struct FamilyRow {
        QString name;
        QString words;
        bool good;
    };
    FamilyRow familyRow(int index) const;

    // The signal is Page::changed().

private:
    // Counts over the files or families of one run of the work.
    struct Tally {
        int done = 0;
        int pieces = 0;
        int passedOver = 0;
        int failed = 0;
    };
    enum class Fate { Listed, Joined, JoinedShort, Failed };

    void typeSize(const QString& text) { Text2.text = text; }
    void stopWork() { m_stop = true; }
    void chooseFilesToCut();
    void cutAll();
    void cutOne();
    void addPieces();
    void joinAll();
    void joinChosen();
    void showLengthOfChosen();
    void chooseFamily(int index);
    void choosePiece(int index);
    void goBack();
    void leave();

    DrivePath pickFile();
    QStringList collect(const DrivePath& folder, Files::Depth depth);
    bool segmentIsRight();
    Cut cut(const DrivePath& path, const QString& extension);
    Joined join(int index);

    void enter(Phase phase);
    void begin();
    void workOn(const DrivePath& path, int index, int count);
    bool step(int done, int total);
    void end(Phase result, const QString& total, const DrivePath& where);
    void tellTroubles();

    QString wording(const QString& hebrew, const QString& english) const;
    void showCounts();
    QString cutTotal(const Tally& tally) const;
    QString joinTotal(const Tally& tally) const;
    QString notCut(const DrivePath& path, const Cut& result) const;
    QString notJoined(const DrivePath& path, const Failure& failure) const;
    QString reason(const Failure& failure) const;

    const SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Mod4split m_pieces;
    std::vector<PieceFamily> m_families; // one for each entry of List4Bodedim
    std::vector<Fate> m_fates;
    bool m_piecesRead = false;      // a folder of pieces was read
    std::optional<qint64> m_length; // of m_lengthOf in bytes; no value before it is asked for, or if it can't be read
    DrivePath m_lengthOf;           // the piece whose length was asked for
    Phase m_phase = Phase::Idle;
    DrivePath m_folder; // folder of the last picked file
    int m_index = 0;    // index of the present file or family
    int m_count = 0;
    int m_percent = 0;
    QStringList m_troubles; // failures of the present work
    bool m_stop = false;
    bool m_leaving = false;
};

} // namespace lumora
