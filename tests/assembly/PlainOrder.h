#pragma once

#include "assembly/plain/Form2.h"
#include "imaging/files/PictureFile.h"
#include "order/PrintFile.h"
#include "support/ExampleOrder.h"
#include "support/PageRig.h"

#include <QMap>

#include <gtest/gtest.h>

namespace lumora {

// A picture with so much noise that its file is large for its size.
inline Bitmap noisyPicture(int width, int height, unsigned seed) {
    Bitmap picture(width, height, Qt::gray);
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            seed = seed * 1664525U + 1013904223U;
            picture.image().setPixelColor(x, y, QColor((seed >> 24) & 255, (seed >> 16) & 255, (seed >> 8) & 255));
        }
    }
    return picture;
}

class PreparingAPlainOrder : public ::testing::Test, protected PageRig {
protected:
    PreparingAPlainOrder() {
        state = exampleOrder();
        state.DiskRoot = machine.drives.programRoot();
        state.Optint = OrderKind::Print;
        state.shemot.TotalPics = 0;
        state.transfer.SugMishloah = Sending::Resend;
        registerBare({PageId::hatchala, PageId::FtpFrm});
        registerPage<Form2>(PageId::Form2);
        makeFolder(u"C:\\vedron"_s);
        makeFolder(u"C:\\pics"_s);
    }

    QString giveFile(const QString& name, const QByteArray& bytes) {
        const DrivePath path = u"C:\\pics"_path / name;
        write(path, bytes);
        return path.text();
    }
    QString givePicture(const QString& name, int width = 40, int height = 30, QColor colour = Qt::red) {
        return giveFile(name, *encodeJpeg(Bitmap(width, height, colour), 92));
    }

    static QString line(const QString& path, const QString& copies = u"1 "_s) { return copies + u"1015GNB"_s + path; }

    Form2& openWith(const QStringList& items) {
        state.handOver.lines = items;
        chain.show(PageId::Form2);
        return *dynamic_cast<Form2*>(chain.find(PageId::Form2));
    }

    DrivePath folder(const QString& number = u"105"_s) const {
        return u"C:\\2000lumora\\!!000"_path / (u"2026_11_21_KUP_1234^"_s + number);
    }
    DrivePath logPath(const QString& number = u"105"_s) const {
        return folder(number) / (u"2026_11_21_KUP_1234^"_s + number + u".txt"_s);
    }
    QStringList printFiles(const QString& number = u"105"_s) const {
        QStringList names = machine.files.names(folder(number), u"*.jpp"_s);
        names.removeIf([](const QString& name) { return name.startsWith(u'!'); });
        return names;
    }
    // The files of the order's folder.
    QMap<QString, QByteArray> content() const {
        QMap<QString, QByteArray> bytes;
        for (const QString& name : machine.files.names(folder(), u"*"_s))
            bytes[name] = read(folder() / name);
        return bytes;
    }
    // The picture inside a print file.
    Result<PrintFileContent> unpacked(const QString& name, const QString& number = u"105"_s) const {
        const Result<QByteArray> bytes = machine.files.read(folder(number) / name);
        return bytes ? readPrintFile(*bytes, PrintFileShape::of(state.profile))
                     : Result<PrintFileContent>(bytes.failure());
    }
    PageId front() const { return chain.front()->id(); }
};

} // namespace lumora
