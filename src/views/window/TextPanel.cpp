#include "views/window/TextPanel.h"

#include <QImageReader>
#include <QScrollBar>
#include <QTextBrowser>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

class TextView : public QTextBrowser {
public:
    TextView(QWidget* parent, const HostPath& folder)
        : QTextBrowser(parent)
        , m_folder(std::filesystem::weakly_canonical(folder)) {
        setOpenLinks(false);
        setFrameShape(QFrame::NoFrame);
        setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        connect(this, &QTextBrowser::anchorClicked, this, [this](const QUrl& link) {
            if (link.hasFragment() && link.adjusted(QUrl::RemoveFragment).isEmpty())
                scrollToAnchor(link.fragment());
        });
    }

protected:
    // Called for pictures, style sheets and whatever else a text names.
    QVariant loadResource(int type, const QUrl& name) override {
        if (type != QTextDocument::ImageResource || !name.isRelative())
            return {};
        std::error_code error;
        const HostPath file = std::filesystem::weakly_canonical(m_folder / toHostPath(name.path()), error);
        const HostPath below = file.lexically_relative(m_folder);
        if (error || below.empty() || *below.begin() == "..")
            return {};
        QImageReader reader(toText(file));
        reader.setAutoTransform(true);
        const QImage picture = reader.read();
        const int bar = verticalScrollBar()->isVisible() ? 0 : verticalScrollBar()->sizeHint().width();
        const int room = viewport()->width() - bar - 2 * static_cast<int>(document()->documentMargin());
        return picture.width() > room && room > 0 ? picture.scaledToWidth(room, Qt::SmoothTransformation) : picture;
    }

private:
    HostPath m_folder;
};

} // namespace

TextPanel::TextPanel(const Theme& theme, QWidget* parent, const QString& title, const QString& html,
                     const HostPath& folder, const QString& closing)
    : Overlay(theme, parent) {
    setObjectName(u"textPanel"_s);
    setAccessibleName(title);
    setWidth(Width::Wide);
    setFilling();
    auto* text = new TextView(this, folder);
    text->setObjectName(u"labText"_s);
    text->setAccessibleName(title);
    // What leads nowhere does not look as if it led somewhere.
    text->document()->setDefaultStyleSheet(u"a { color: %1; text-decoration: none }"_s.arg(Theme::Colour::Ink.name()));
    text->setHtml(html);
    QPushButton* close = plainButton(u"textClose"_s, "main", [this] { Q_EMIT closed(); });
    close->setText(closing);
    close->setAccessibleName(closing);
    column()->addWidget(words("title", isolated(title)));
    column()->addWidget(text, 1);
    addButton(close);
    setFirstFocus(close);
    whenEscaped([this] { Q_EMIT closed(); });
}

} // namespace lumora
