#include "editing/editor/Form3.h"

#include "imaging/drawing/Drawing.h"
#include "order/KeptPictures.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/CaptionTexts.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "session/SharedWords.h"

#include <algorithm>

namespace lumora {
namespace {

constexpr int boxWidth = 700;
constexpr int mostBoxHeight = 20'000;
// Pixels of the picture for one logical pixel of the box: the page may be shown larger.
constexpr int fineness = 2;

} // namespace

Form3::Form3(const SessionState& state, const Platform& platform, PageChain& chain)
    : Page(pageId)
    , m_state(state)
    , m_platform(platform)
    , m_chain(chain) {}

void Form3::load() {
    setTexts();
}

void Form3::setTexts() {
    setCaptions(m_state, {{Command1, u"סובב", u"Turn"},
                          {Command2, u"הצג שוב", u"Show again"},
                          {Command3, u"יציאה", u"Exit"},
                          {unreadable, u"אי אפשר להציג את התמונה", u"The picture can't be shown"}});
    Q_EMIT changed();
}

void Form3::open(const DrivePath& path) {
    m_path = path;
    Label1.text = path.text();
    fileName.text = path.leaf();
    angle = 0;
    draw();
}

void Form3::turn() {
    angle = (angle + 90) % 360;
    draw();
}

void Form3::draw() {
    Picture2 = {};
    Picture2Box = {};
    const Result<Bitmap> picture = read();
    if (picture) {
        Picture2 = turned(*picture, static_cast<QuarterTurn>(angle));
        if (angle == 90 || angle == 270)
            std::swap(Picture2Box.width, Picture2Box.height);
    } else {
        Picture2Box = {};
        m_platform.dialogs.message(
            m_state.wording(u"לא ניתן לפתוח את התמונה %1.\n%2", u"The picture %1 can't be opened.\n%2")
                .arg(m_path.leaf(), warnedWords(m_state, picture.failure(), m_path)));
    }
    unreadable.visible = Picture2.isNull();
    Q_EMIT changed();
}

Result<Bitmap> Form3::read() {
    const std::optional<HostPath> file = KeptPictures(m_platform.files, m_state.keptFolder).hostOf(m_path);
    if (!file)
        return Failure{Failure::Kind::NotFound, m_path.text()};
    const auto size = readPictureSize(*file);
    if (!size)
        return size.failure();
    const double aspect = static_cast<double>(size->height) / size->width;
    Picture2Box = {boxWidth, std::clamp(static_cast<int>(boxWidth * aspect), 1, mostBoxHeight)};
    // More pixels than the file has would add nothing.
    const int times = Picture2Box.height > size->height ? 1 : fineness;
    return loadPictureScaled(*file, {Picture2Box.width * times, Picture2Box.height * times});
}

void Form3::close() {
    m_chain.unload(pageId);
}

} // namespace lumora
