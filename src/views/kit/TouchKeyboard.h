#pragma once

#include "views/kit/Maker.h"

#include <QPointer>
#include <QStringList>

#include <functional>
#include <map>
#include <vector>

class QStackedLayout;
class QTouchEvent;

namespace lumora {

struct KeyRows;

// The keys on the screen for whatever takes text; who shows them types what they say. No key takes the focus from the
// field. A key is named by what it types, "key(a)".
class TouchKeyboard : public QFrame, private Maker {
    Q_OBJECT
public:
    static constexpr int letterKeys = 30;
    // What the letter keys type, row by row from the left; each text is letterKeys long.
    struct Layouts {
        QString hebrew;
        QString latin;
    };
    enum class Letters { Hebrew, Latin };
    enum class Panel { Letters, Digits };
    // hebrew and latin call for the other letters.
    struct Words {
        QString back, next, done, space, capitals, hebrew, latin;
    };

    TouchKeyboard(const Theme& theme, QWidget* parent, Layouts layouts);

    void setWords(const Words& words);
    void setPanel(Panel panel);
    void setLetters(Letters letters);
    Letters letters() const { return m_letters; }
    void setCapitals(bool on);
    // Whole words above the letters.
    void setOffers(const QStringList& texts);
    // Whether another field comes behind this one.
    void setNext(bool there);

    // Whether the widget is a keyboard of this kind or a part of one.
    static bool has(const QWidget& widget);

Q_SIGNALS:
    void typed(const QString& text);
    void back();
    void next();
    void done();
    void offered(const QString& text);
    void lettersChosen();

protected:
    bool event(QEvent* event) override;

private:
    void follow(const QTouchEvent& touch);
    QPushButton* key(const QString& types);
    QPushButton* wordKey(const QString& name, std::function<void()> pressed);
    static void name(QPushButton& key, const QString& types);
    void addEditing(KeyRows& keys);
    QWidget* makeLetters();
    QWidget* makeDigits();
    void relabel();

    const Theme& m_theme;
    Layouts m_layouts;
    Words m_words;
    Letters m_letters = Letters::Hebrew;
    bool m_capitals = false;
    QWidget* m_offers;
    QGridLayout* m_offerGrid;
    QStackedLayout* m_panels;
    std::vector<QPushButton*> m_letterKeys;
    std::vector<QPushButton*> m_back; // one a panel, as the two below
    std::vector<QPushButton*> m_next;
    std::vector<QPushButton*> m_done;
    QPushButton* m_otherLetters = nullptr;
    QPushButton* m_capitalKey = nullptr;
    QPushButton* m_space = nullptr;
    std::map<int, QPointer<QPushButton>> m_held; // by the number of the finger
};

} // namespace lumora
