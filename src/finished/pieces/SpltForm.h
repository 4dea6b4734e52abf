#pragma once

#include "finished/pieces/Mod4split.h"
#include "platform/files/Files.h"
#include "session/Caption.h"
#include "session/Page.h"
#include "session/TextList.h"

#include <vector>

namespace lumora {

class PageChain;
struct Platform;
struct SessionState;

// The operator's page of pieces: cuts the files of a folder into pieces that a slow line can carry, and joins families
// of pieces into the file again. It works on any folder, reads what it is given and writes beside it. Long work yields
// between two pieces, and can be stopped there.
class SpltForm : public Page {
    Q_OBJECT
public:
    SpltForm(SessionState& state, const Platform& platform, PageChain& chain);

    void setTexts() override;

    // Events.
    void Text2_Change(const QString& text); // the segment
    void Command2_Click();                  // choose the folder of the files to cut
    void Command3_Click();                  // "Split All"
    void Command9_Click();                  // "splitOne"
    void Command8_Click();                  // adds the files of a folder, and of those below it, to the pieces
    void Command1_Click();                  // "MergeAll"
    void Command4_Click();                  // "Merge": the chosen family, complete or not
    void Command6_Click();                  // "Filelen" of the chosen file
    void Command5_Click() {}                // "Find Famely": never did anything
    void List4Bodedim_Click(int index);
    void ListChalakim_Click(int index);
    void Command15_Click(); // stop
    void Image3_Click();    // back to the finished orders; work under way ends first

    // State.
    Caption Text2;
    TextList List4files;   // files to cut, full paths
    TextList ListChalakim; // every file of the folders read so far, full paths
    TextList List4Bodedim; // of each family its first listed piece
    TextList List4Famely;  // the pieces of the family in hand
    Caption Command1;
    Caption Command2;
    Caption Command3;
    Caption Command4;
    Caption Command5;
    Caption Command6;
    Caption Command8;
    Caption Command9;
    Caption Command15;
    Caption Image3;
    Caption Label1;      // count of ListChalakim
    Caption Label5;      // count of List4Bodedim
    Caption Label8;      // length of the chosen file in bytes
    Caption Label9;      // its drive, "C:"
    Caption Label4Text2; // "size of a piece, in bytes"
    Caption Label4Work;  // what is in hand; empty while nothing is
    Caption Label4Total; // what came of it
    Caption Label4Where; // the folder where the result lies, else empty

    // What is known of each entry of List4Bodedim.
    struct Family {
        int declared = 0;
        int count = 0;
        int verdict = 0;
        bool listedTwice = false; // the same path more than once: its folder was read again
        enum class Fate { Listed, Joined, JoinedShort, Failed } fate = Fate::Listed;
    };
    std::vector<Family> families;
    // In words for a person.
    QString familyWords(int index) const;

    enum class Outcome { None, Good, Partly, Failed };
    Outcome outcome = Outcome::None;
    bool busy = false;
    int percent = 0; // of the work in hand

    // The signal is Page::changed().

private:
    QString wording(const QString& hebrew, const QString& english) const;
    QString pickFile();
    QStringList collect(const QString& folder, Files::Depth depth);
    void judgeFamilies();
    void showWhatCanBeDone();

    bool segmentIsRight();
    void begin();
    void forgetOutcome();
    void workOn(const QString& path, int index, int count);
    bool step(int done, int total);
    void end(Outcome result, const QString& total, const QString& where);
    Cut cut(const QString& path, const QString& extension);
    Joined join(int index);
    QString reason(const Failure& failure) const;
    void tellTroubles();
    void leave();

    SessionState& m_state;
    const Platform& m_platform;
    PageChain& m_chain;
    Mod4split m_pieces;
    QString m_folder; // where the last file was picked
    int m_index = 0;  // of the file or family in hand
    int m_count = 0;
    QStringList m_troubles; // of the work in hand
    bool m_stop = false;
    bool m_leaving = false;
};

} // namespace lumora
