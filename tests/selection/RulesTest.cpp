#include "editing/EditRecord.h"
#include "selection/Basket.h"
#include "selection/FinishRule.h"
#include "selection/FolderPager.h"
#include "selection/PrintQuality.h"
#include "session/SessionState.h"

#include <gtest/gtest.h>

namespace lumora {
namespace {

const QString path = QStringLiteral("C:\\pics\\תמונה.jpg");

TEST(APrintCode, keepsItsColumnsWhateverItsFieldsHold) {
    struct Case {
        PrintCode code;
        QString text;
    };
    for (const Case& c : {Case{{12, QStringLiteral("1015"), u'M', QStringLiteral("WB")}, QStringLiteral("121015MWB")},
                          Case{{1, {}, u' ', QStringLiteral("WBX")}, QStringLiteral("1      WB")},
                          Case{{3, QStringLiteral("203040"), u'G', {}}, QStringLiteral("3 2030G  ")}})
        EXPECT_EQ(c.code.compose(), c.text);

    const PrintCode back = PrintCode::split(QStringLiteral("121015MWBC:\\a.jpg"));
    EXPECT_EQ(back.copies, 12);
    EXPECT_EQ(back.compose(), QStringLiteral("121015MWB"));
    EXPECT_EQ(PrintCode::copiesOf(QString()), 0);
}

TEST(APaperLetter, isReadFromTheWordsThatEachPathKnows) {
    struct Case {
        QString word;
        char16_t clicked;
        char16_t wholeFolder;
    };
    for (const Case& c : {Case{QStringLiteral("מט"), u'M', u'M'}, Case{QStringLiteral("מבריק"), u'G', u'G'},
                          Case{QStringLiteral("M"), u'M', u'M'}, Case{QStringLiteral("Matte"), u'M', u'x'},
                          Case{QStringLiteral("Glossy"), u'G', u'x'}, Case{QStringLiteral("***"), u'x', u'x'}}) {
        EXPECT_EQ(paperLetter(c.word, PaperWords::All, u'x'), c.clicked) << c.word.toStdString();
        EXPECT_EQ(paperLetter(c.word, PaperWords::WholeFolder, u'x'), c.wholeFolder) << c.word.toStdString();
    }
}

TEST(ASizeField, hasTheEndsOfThePaperAndIsBlankForASpecialSize) {
    OrderDetails shemot;
    shemot.ppr = QStringLiteral("09/13");
    EXPECT_EQ(sizeField(shemot), QStringLiteral("0913"));
    shemot.ppr = QStringLiteral("zz/zz");
    EXPECT_EQ(sizeField(shemot), QStringLiteral("    "));
}

TEST(ABasketLine, splitsIntoWhatItWasComposedOfInBothForms) {
    const BasketLine line{{7, QStringLiteral("1318"), u'G', QStringLiteral("NB")}, EditRecord::newPicture(), path};
    EXPECT_EQ(line.compose(LineForm::Short), QStringLiteral("7 1318GNB") + path);
    const QString full = line.compose(LineForm::Full);
    EXPECT_EQ(full.size(), 209 + path.size());
    const BasketLine back = BasketLine::split(full, LineForm::Full);
    EXPECT_EQ(back.path, path);
    EXPECT_EQ(back.editState, EditRecord::newPicture());
}

TEST(AnEditRecord, unpacksByPositionAndReadsBlanksAsTheirDefaults) {
    EditFields fields;
    fields.PicturePath = path;
    UnpackEditState(EditRecord::newPicture(), fields);
    EXPECT_EQ(fields.GainB, 1.0F);
    EXPECT_EQ(fields.RotationCode, 180);
    EXPECT_EQ(fields.PanY, 999);
    EXPECT_EQ(fields.AutoMarker, QStringLiteral("000"));
    EXPECT_EQ(fields.TextFontSize, 8);
    EXPECT_EQ(fields.EditState.size(), 200);
    EXPECT_EQ(fields.PicturePath, path);

    // One character of its own at the start of each field shows that no column is shifted.
    const QString record = QStringLiteral("1.290.5 0.02170210-99 12  1  2  034R11RED111") +
                           LeftField(QStringLiteral("kids"), 10) +
                           QStringLiteral("242 7 8 1 ddd       255128 1 45 60 9  3 2 ") +
                           LeftField(QStringLiteral("David"), 30) + LeftField(QStringLiteral("שלום  עולם"), 70);
    UnpackEditState(record, fields);
    EXPECT_FLOAT_EQ(fields.GainR, 1.29F);
    EXPECT_FLOAT_EQ(fields.GainB, 0.02F);
    EXPECT_EQ(fields.RotationCode, 170);
    EXPECT_EQ(fields.ZoomPercent, 210);
    EXPECT_EQ(fields.PanX, -99);
    EXPECT_EQ(fields.PanY, 12);
    EXPECT_EQ(fields.ToneFlag, 1);
    EXPECT_EQ(fields.SpareFlag, 2);
    EXPECT_EQ(fields.FrameName, QStringLiteral("034"));
    EXPECT_EQ(fields.LineFrameCode, QStringLiteral("R11"));
    EXPECT_EQ(fields.RedMarker, QStringLiteral("RED"));
    EXPECT_EQ(fields.FrameFolder, QStringLiteral("kids"));
    EXPECT_EQ(fields.TextFontSize, 24);
    EXPECT_EQ(fields.TextAlign, 2);
    EXPECT_EQ(fields.TextOn, 1);
    EXPECT_EQ(fields.Tag, QStringLiteral("ddd"));
    EXPECT_EQ(fields.TextBlue, 255);
    EXPECT_EQ(fields.TextGreen, 128);
    EXPECT_EQ(fields.TextRed, 1);
    EXPECT_EQ(fields.TextX, 45);
    EXPECT_EQ(fields.TextY, 60);
    EXPECT_EQ(fields.TextVertical, 3);
    EXPECT_EQ(fields.TextStyle, 2);
    EXPECT_EQ(fields.TextFont, QStringLiteral("David"));
    EXPECT_EQ(fields.TextBody, QStringLiteral("שלום  עולם"));
}

QString plainLine(int copies, const QString& of) {
    return BasketLine{{copies, QStringLiteral("1015"), u'G', QStringLiteral("NB")}, {}, of}.compose(LineForm::Short);
}

TEST(ABasket, findsTheFirstLineOfAPathAfterEachKindOfChange) {
    for (const LineForm form : {LineForm::Short, LineForm::Full}) {
        Basket basket;
        basket.setForm(form);
        const auto add = [&](int copies, const QString& of) {
            basket.append(
                BasketLine{{copies, QStringLiteral("1015"), u'G', QStringLiteral("NB")}, EditRecord::newPicture(), of}
                    .compose(form));
        };
        const auto find = [&](const char* of) { return basket.FindByPath(QString::fromLatin1(of)); };
        add(1, QStringLiteral("C:\\a.jpg"));
        add(2, QStringLiteral("C:\\b.jpg"));
        add(3, QStringLiteral("C:\\a.jpg"));
        EXPECT_EQ(find("C:\\a.jpg"), 0);
        EXPECT_EQ(find("C:\\c.jpg"), -1);
        basket.removeAt(0);
        EXPECT_EQ(find("C:\\a.jpg"), 1);
        EXPECT_EQ(find("C:\\b.jpg"), 0);
        basket.replaceAt(0, QString(basket.item(1)).replace(QStringLiteral("a.jpg"), QStringLiteral("c.jpg")));
        EXPECT_EQ(find("C:\\b.jpg"), -1);
        EXPECT_EQ(find("C:\\c.jpg"), 0);
        EXPECT_EQ(basket.SumCopies(), 6);
        EXPECT_EQ(basket.FindExact(basket.item(1)), 1);
        basket.clear();
        EXPECT_EQ(find("C:\\a.jpg"), -1);
        EXPECT_EQ(basket.SumCopies(), 0);
    }
}

TEST(ABasket, stopsItsSearchAtALineThatIsTooShort) {
    Basket basket;
    basket.append(plainLine(1, QStringLiteral("C:\\a.jpg")));
    basket.append(QStringLiteral("1 1015GNBC:"));
    basket.append(plainLine(1, QStringLiteral("C:\\b.jpg")));
    EXPECT_EQ(basket.FindByPath9(QStringLiteral("C:\\a.jpg")), 0);
    EXPECT_EQ(basket.FindByPath9(QStringLiteral("C:\\b.jpg")), -1);
    basket.removeAt(1);
    EXPECT_EQ(basket.FindByPath9(QStringLiteral("C:\\b.jpg")), 1);
}

TEST(ABasket, holdsTheSumOfCopiesAtWhatAFieldOf16BitsTakes) {
    Basket basket;
    for (int i = 0; i < 400; ++i)
        basket.append(plainLine(99, QStringLiteral("C:\\%1.jpg").arg(i)));
    EXPECT_EQ(basket.SumCopies(), 32767);
    while (basket.count() > 2)
        basket.removeAt(0);
    EXPECT_EQ(basket.SumCopies(), 198);
}

TEST(ABasket, dropsLaterLinesThatDifferInTheirCopiesOnly) {
    Basket basket;
    for (const auto& [copies, name] : {std::pair{5, "a"}, {2, "b"}, {9, "a"}, {1, "a"}})
        basket.append(plainLine(copies, QStringLiteral("C:\\%1.jpg").arg(QLatin1String(name))));
    basket.removeDuplicates();
    EXPECT_EQ(basket.lines().items(),
              QStringList({plainLine(5, QStringLiteral("C:\\a.jpg")), plainLine(2, QStringLiteral("C:\\b.jpg"))}));
    EXPECT_EQ(basket.SumCopies(), 7);
}

QStringList names(int count) {
    QStringList list;
    for (int i = 1; i <= count; ++i)
        list += QStringLiteral("%1.jpg").arg(i, 2, 10, QLatin1Char('0'));
    return list;
}

TEST(AFolderPager, showsThirteenPicturesAsTwelveThenTheLastOneAgainAndAgain) {
    FolderPager pager;
    EXPECT_EQ(pager.addFolder(QStringLiteral("C:\\p"), names(13)), 13);
    EXPECT_EQ(pager.FillPageList().size(), 12);
    EXPECT_EQ(pager.FillPageList(), QStringList(QStringLiteral("C:\\p\\13.jpg")));
    EXPECT_EQ(pager.FillPageList(), QStringList(QStringLiteral("C:\\p\\13.jpg")));
    pager.PageBack();
    EXPECT_EQ(pager.FillPageList().first(), QStringLiteral("C:\\p\\01.jpg"));
}

TEST(AFolderPager, beginsBehindASecondFolderWithTheLastPictureOfTheFirst) {
    FolderPager pager;
    pager.addFolder(QStringLiteral("C:\\p"), names(3));
    pager.FillPageList();
    pager.addFolder(QStringLiteral("C:\\q"), names(5));
    const QStringList page = pager.FillPageList();
    EXPECT_EQ(page.first(), QStringLiteral("C:\\p\\03.jpg"));
    EXPECT_EQ(page.size(), 6);
}

TEST(AFolderPager, doublesAnOrdinaryFolderButNoDriveRoot) {
    FolderPager pager;
    for (int i = 0; i < 2; ++i)
        pager.addFolder(QStringLiteral("C:\\p"), names(4));
    EXPECT_EQ(pager.count(), 8);
    EXPECT_EQ(pager.addFolder(QStringLiteral("E:\\"), names(4)), 4);
    EXPECT_EQ(pager.item(8), QStringLiteral("E:\\01.jpg"));
    pager.FillPageList();
    const int position = pager.currentIndex();
    EXPECT_EQ(pager.addFolder(QStringLiteral("E:\\"), names(4)), 0);
    EXPECT_EQ(pager.currentIndex(), position);
}

TEST(AFolderPager, takesNoPictureOfAFolderForOneBesideIt) {
    FolderPager pager;
    pager.addFolder(QStringLiteral("C:\\p"), {QStringLiteral("a01.jpg")});
    EXPECT_EQ(pager.addFolder(QStringLiteral("C:\\p\\a"), names(2)), 2);
}

TEST(AFolderPager, goesBackByThePageInViewAndTheOneBefore) {
    for (const auto& [pages, firstAfterBack] : {std::pair{1, 1}, {2, 1}, {3, 13}, {4, 25}}) {
        FolderPager pager;
        pager.addFolder(QStringLiteral("C:\\p"), names(60));
        for (int i = 0; i < pages; ++i)
            pager.FillPageList();
        pager.PageBack();
        EXPECT_EQ(pager.FillPageList().first(),
                  QStringLiteral("C:\\p\\%1.jpg").arg(firstAfterBack, 2, 10, QLatin1Char('0')));
    }
}

TEST(APrintGrade, goesByThePixelCountAlone) {
    struct Case {
        PictureSize size;
        PrintGrade grade;
        QString text;
    };
    for (const Case& c : {Case{{1600, 1200}, PrintGrade::Good, QStringLiteral("  איכות  1200 / 1600")},
                          Case{{1000, 800}, PrintGrade::Unmarked, {}},
                          Case{{799999, 1}, PrintGrade::Borderline, QStringLiteral("  איכות גבולית  1 / 799999")},
                          Case{{500, 800}, PrintGrade::Borderline, QStringLiteral("  איכות גבולית  800 / 500")},
                          Case{{1, 399999}, PrintGrade::VeryLow, QStringLiteral("  איכות נמוכה מאוד  399999 / 1")},
                          Case{{65500, 65500}, PrintGrade::Good, QStringLiteral("  איכות  65500 / 65500")}}) {
        EXPECT_EQ(printGrade(c.size), c.grade);
        EXPECT_EQ(printGradeText(c.grade, c.size, false), c.text);
    }
    EXPECT_EQ(largeViewSize({1000, 1000}), (PictureSize{300, 300}));
    EXPECT_EQ(largeViewSize({4000, 3000}), (PictureSize{400, 300}));
    EXPECT_EQ(largeViewSize({3000, 4000}), (PictureSize{300, 400}));
}

TEST(AFinish, compressesLargePrintsAsThePolicySays) {
    struct Case {
        const char* paper;
        DeepCompression asking;
        DeepCompression always;
    };
    for (const Case& c : {Case{"30/45", DeepCompression::Ask, DeepCompression::On},
                          Case{"50/70", DeepCompression::Ask, DeepCompression::On},
                          Case{"20/30", DeepCompression::Off, DeepCompression::Off},
                          Case{"", DeepCompression::Off, DeepCompression::Off},
                          Case{"zz/zz", DeepCompression::Off, DeepCompression::Off}}) {
        EXPECT_EQ(deepCompression(QString::fromLatin1(c.paper), 1), c.asking) << c.paper;
        EXPECT_EQ(deepCompression(QString::fromLatin1(c.paper), 2), c.always) << c.paper;
    }
    EXPECT_EQ(checkCoupon(220, 221), CouponFit::TooMany);
    EXPECT_EQ(checkCoupon(220, 219), CouponFit::TooFew);
    EXPECT_EQ(checkCoupon(220, 220), CouponFit::Matches);
}

} // namespace
} // namespace lumora
