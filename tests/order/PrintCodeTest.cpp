#include "order/BasketLine.h"
#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

const QString path = u"C:\\pics\\תמונה.jpg"_s;

TEST(APrintCode, keepsItsColumnsWhateverItsFieldsHold) {
    struct Case {
        PrintCode code;
        QString text;
    };
    for (const Case& c :
         {Case{{12, u"1015"_s, u'M', u"WB"_s}, u"121015MWB"_s}, Case{{1, {}, u' ', u"WBX"_s}, u"1      WB"_s},
          Case{{3, u"203040"_s, u'G', {}}, u"3 2030G  "_s}})
        EXPECT_EQ(c.code.compose(), c.text);

    EXPECT_EQ(PrintCode::copiesOf(u"121015MWBC:\\a.jpg"_s), 12);
    EXPECT_EQ(PrintCode::copiesOf(QString()), 0);
}

TEST(APaperLetter, isReadFromTheWordsThatEachPathKnows) {
    struct Case {
        QString word;
        char16_t clicked;
        char16_t wholeFolder;
    };
    for (const Case& c : {Case{u"מט"_s, u'M', u'M'}, Case{u"מבריק"_s, u'G', u'G'}, Case{u"M"_s, u'M', u'M'},
                          Case{u"Matte"_s, u'M', u'x'}, Case{u"Glossy"_s, u'G', u'x'}, Case{u"***"_s, u'x', u'x'}}) {
        EXPECT_EQ(paperLetter(c.word, PaperWords::All, u'x'), c.clicked) << c.word.toStdString();
        EXPECT_EQ(paperLetter(c.word, PaperWords::WholeFolder, u'x'), c.wholeFolder) << c.word.toStdString();
    }
}

TEST(ASizeField, hasTheEndsOfThePaperAndIsBlankForASpecialSize) {
    OrderDetails shemot;
    shemot.ppr = u"09/13"_s;
    EXPECT_EQ(sizeField(shemot), u"0913"_s);
    shemot.ppr = u"zz/zz"_s;
    EXPECT_EQ(sizeField(shemot), u"    "_s);
}

TEST(ABasketLine, splitsIntoWhatItWasComposedOfInBothForms) {
    const BasketLine line{u"7 1318GNB"_s, EditRecord::newPicture(), DrivePath(path)};
    EXPECT_EQ(line.compose(LineForm::Short), u"7 1318GNB"_s + path);
    const QString full = line.compose(LineForm::Full);
    EXPECT_EQ(full.size(), 209 + path.size());
    const BasketLine back = BasketLine::split(full, LineForm::Full);
    EXPECT_EQ(back.code, line.code);
    EXPECT_EQ(back.path.text(), path);
    EXPECT_EQ(back.editState, EditRecord::newPicture());
    EXPECT_EQ(BasketLine::withCopies(full, 12), u"121318GNB"_s + full.mid(9));
}

TEST(TheCopiesOfAnOrder, areTheFirstTwoCharactersOfAllButTexts) {
    const QStringList names{u"99order.txt"_s, u"!105_1234.jpp"_s, u"021015G.jpp"_s, u"1 1015G.jpp"_s,
                            u"000.jpg"_s,     u"ab.jpp"_s,        u".7.jpg"_s};
    EXPECT_EQ(sumOfCopies(names, CopiesIn::FileNames), 3);
    EXPECT_EQ(sumOfCopies(names, CopiesIn::BasketLines), 4);
    EXPECT_EQ(sumOfCopies(QStringList(400, u"99.jpp"_s), CopiesIn::FileNames), 32767);
}

} // namespace
} // namespace lumora
