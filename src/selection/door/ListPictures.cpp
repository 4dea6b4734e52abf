#include "selection/door/ListPictures.h"

#include "common/Background.h"
#include "door/DoorDecoder.h"
#include "door/HeaderOfFile.h"
#include "door/Orientation.h"
#include "door/PictureDraft.h"
#include "imaging/files/PictureFile.h"

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

Result<Bitmap> listPicture(const HostPath& path, const HostPath& doorProgram, DoorRules rules, int cell,
                           const std::stop_token& stop) {
    const Result<PictureHeader> header = rules.any() ? headerOf(path) : PictureHeader();
    if (rules.everyFormat && (!header || header->kind != PictureKind::Jpeg)) {
        const Result<QByteArray> small = DoorDecoder(doorProgram).listed(path, stop);
        if (!small)
            return small.failure();
        const Bitmap picture = pictureDraft(*small, cell);
        return picture.isNull() ? Result<Bitmap>(Failure{Failure::Kind::Damaged, toText(path)}) : picture;
    }
    const Result<Bitmap> picture = loadSmallPictures({path}, cell).front();
    return picture && rules.upright && header ? upright(*picture, header->orientation) : picture;
}

} // namespace

ListPictures::ListPictures(HostPath doorProgram, DoorRules rules, int cell)
    : m_doorProgram(std::move(doorProgram))
    , m_rules(rules)
    , m_cell(cell) {}

ListPictures::~ListPictures() {
    m_stop.request_stop();
}

void ListPictures::stop() {
    m_stop.request_stop();
    m_stop = std::stop_source();
}

void ListPictures::read(int row, const HostPath& path) {
    runInBackground([ticket = m_desk.ticket(), row, path, program = m_doorProgram, rules = m_rules, cell = m_cell,
                     stop = m_stop.get_token()] {
        const Result<Bitmap> picture = listPicture(path, program, rules, cell, stop);
        ticket.handIn([row, picture, stop](ListPictures& list) {
            if (!stop.stop_requested())
                Q_EMIT list.done(row, picture);
        });
    });
}

} // namespace lumora
