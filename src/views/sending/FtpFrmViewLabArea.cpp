// The lab's own area of the page that sends by FTP: the lists of the sending, the chain of orders and the manual panel.
#include "views/kit/Overlay.h"
#include "views/sending/FtpFrmView.h"

#include <QCheckBox>
#include <QLineEdit>

namespace lumora {

void FtpFrmView::makeLabArea() {
    m_labArea = makeLabPanel({{makeSendingLists(), 1}, makeReporting(), makeChain(), {makeManual(), 1}},
                             button(c.Command9, Role::Main, &FtpFrm::Command9_Click));
    m_labArea->whenEscaped(toPage(&FtpFrm::Command9_Click));
}

QLayout* FtpFrmView::makeSendingLists() {
    const FtpLists& of = m_page.lists();
    QGridLayout* lists = inGrid(Space::Small);
    addLabList(*lists, c.Label4ToSend, u"List3", of.List3);
    addLabList(*lists, c.Label4OnServer, u"List6", of.List6);
    addLabList(*lists, c.Label4Failed, u"List7", of.List7);
    addLabList(*lists, c.Label4Remains, u"List4Broken", of.List4Broken);
    QGridLayout* log = inGrid(Space::Small);
    addLabList(*log, c.Label4Log, u"LogList", of.LogList);
    QWidget* incomplete = inBox(inRow(
        Space::Small,
        {lineLabel(c.Label4List9, "smallMuted"), lineLabel(c.Label31, "small"), {label(c.Label4Hamtana, "small"), 1}}));
    follow(incomplete, c.Picture6);
    QWidget* round =
        inBox(inRow(Space::Small, {lineLabel(c.Frame9, "smallMuted"), lineLabel(c.Label4, "small"), Item::room()}));
    follow(round, c.Frame9);
    return inColumn(Space::Small,
                    {{lists, 2},
                     {log, 1},
                     incomplete,
                     round,
                     inRow(Space::Small, {button(c.Command13, Role::Plain, &FtpFrm::Command13_Click),
                                          button(c.Command1, Role::Plain, &FtpFrm::Command1_Click),
                                          button(c.Command2, Role::Plain, &FtpFrm::Command2_Click),
                                          button(c.Command4, Role::Plain, &FtpFrm::Command4_Click), Item::room(),
                                          button(c.Command21, Role::Plain, &FtpFrm::Command21_Click)})});
}

QLayout* FtpFrmView::makeChain() {
    QGridLayout* orders = inGrid(Space::Small);
    addLabList(*orders, c.Label4Orders, u"ListRezefFiles", m_page.lists().ListRezefFiles,
               toPage(&FtpFrm::ListRezefFiles_Click));
    m_chain = inBox(orders);
    return inColumn(Space::Small,
                    {m_chain, inRow(Space::Small, {button(c.Command17, Role::Plain, &FtpFrm::Command17_Click),
                                                   button(c.Command19, Role::Plain, &FtpFrm::Command19_Click),
                                                   button(c.Command25, Role::Plain, &FtpFrm::Command25_Click),
                                                   lineLabel(c.Label4siem, "small"),
                                                   {label(c.Label4Rezef, "smallMuted"), 1}})});
}

QPushButton* FtpFrmView::toggle(const CheckCaption& caption, void (FtpFrm::*clicked)()) {
    auto* made = new QPushButton(this);
    setRole(made, "plain");
    made->setFocusPolicy(Qt::TabFocus);
    bindChoice(made, caption, toPage(clicked));
    return made;
}

QLayout* FtpFrmView::makeManual() {
    QLabel* proxyTitle = lineLabel(c.Label4Proxy, "smallMuted");
    QLineEdit* proxy = field(c.txtProxy, toPage(&FtpFrm::txtProxy_Change));
    proxy->setLayoutDirection(Qt::LeftToRight);
    proxyTitle->setBuddy(proxy);
    const FtpLists& of = m_page.lists();
    QGridLayout* lists = inGrid(Space::Small);
    addLabList(*lists, c.Label4File1, u"File1", of.File1, toPage(&FtpFrm::File1_Click));
    addLabList(*lists, c.Label4Home, u"List1", of.List1);
    addLabList(*lists, c.Label4Level1, u"List4", of.List4);
    addLabList(*lists, c.Label4Level2, u"List5", of.List5);
    addLabList(*lists, c.Label4Present, u"List2", of.List2, toPage(&FtpFrm::List2_Click));
    lists->addLayout(inColumn(Space::None, {label(c.Label37, "small"), label(c.Label38, "small")}), 2, 2);
    lists->addLayout(inColumn(Space::None, {label(c.Label40, "small"), label(c.Label41, "small")}), 2, 3);
    lists->addLayout(inColumn(Space::None, {label(c.Label5, "small"), Item::room()}), 2, 4);
    return inColumn(Space::Small,
                    {inRow(Space::Small, {lineLabel(c.Label4Manual, "strong"), {echo(c.Label3, "smallMuted"), 1}}),
                     inRow(Space::Small, {button(c.cmdInternetOpen, Role::Plain, &FtpFrm::cmdInternetOpen_Click),
                                          button(c.cmdClosehOpen, Role::Plain, &FtpFrm::cmdClosehOpen_Click),
                                          toggle(c.optBin, &FtpFrm::optBin_Click),
                                          toggle(c.optAscii, &FtpFrm::optAscii_Click),
                                          checkBox(c.chkPassive, toPage(&FtpFrm::chkPassive_Click)),
                                          Item::room(),
                                          proxyTitle,
                                          {proxy, 1}}),
                     {lists, 1},
                     inRow(Space::Small, {button(c.Command3, Role::Plain, &FtpFrm::Command3_Click),
                                          button(c.Command5, Role::Plain, &FtpFrm::Command5_Click),
                                          button(c.Command6, Role::Plain, &FtpFrm::Command6_Click),
                                          button(c.Command7, Role::Plain, &FtpFrm::Command7_Click), Item::room()})});
}

} // namespace lumora
