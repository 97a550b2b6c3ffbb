// SPDX-License-Identifier: MIT
// zelkov-docs-pictures: cuts the pictures that pictures.txt names out of the shots of the gallery.
#include <QtCore/QDir>
#include <QtCore/QFile>
#include <QtCore/QStringList>
#include <QtCore/QTextStream>
#include <QtGui/QImage>

namespace
{
// The gallery's window without the bar at the top, the list at the left and the log at the bottom.
const QRect c_page(238, 48, 1000, 648);

QRect cutOf(const QString& text, const QImage& shot)
{
    if (text == QLatin1String("window")) {
        return shot.rect();
    }
    if (text == QLatin1String("page")) {
        return c_page;
    }
    const QStringList numbers = text.split(QLatin1Char(','));
    return numbers.size() != 4 ? QRect()
                               : QRect(numbers.at(0).toInt(), numbers.at(1).toInt(), numbers.at(2).toInt(),
                                   numbers.at(3).toInt());
}

// An empty text, or what went wrong.
QString cut(const QStringList& words, const QDir& shots, const QDir& pictures)
{
    if (words.size() != 4) {
        return QStringLiteral("a line is a name, a page, a theme and a cut");
    }
    const QString file = shots.filePath(QStringLiteral("%1-%2.png").arg(words.at(1), words.at(2)));
    const QImage shot(file);
    if (shot.isNull()) {
        return QStringLiteral("cannot read ") + file;
    }
    const QRect rect = cutOf(words.at(3), shot);
    if (!rect.isValid() || !shot.rect().contains(rect)) {
        return QStringLiteral("no such cut: ") + words.at(3);
    }
    const QString picture = pictures.filePath(words.at(0) + QStringLiteral(".png"));
    const QImage wanted = shot.copy(rect).convertToFormat(QImage::Format_RGB888);
    // A picture that shows the same stays the same file.
    const QImage present(picture);
    if (present.convertToFormat(QImage::Format_RGB888) == wanted) {
        return QString();
    }
    return wanted.save(picture, "PNG", 0) ? QString() : QStringLiteral("cannot write ") + picture;
}
}

int main(int argc, char* argv[])
{
    QTextStream err(stderr);
    if (argc != 4) {
        err << "usage: zelkov-docs-pictures TABLE SHOTS PICTURES\n";
        return 2;
    }
    QFile table(QFile::decodeName(argv[1]));
    if (!table.open(QIODevice::ReadOnly)) {
        err << "cannot read " << table.fileName() << '\n';
        return 1;
    }
    int result = 0;
    int number = 0;
    while (!table.atEnd()) {
        const QString line = QString::fromUtf8(table.readLine()).simplified();
        ++number;
        if (line.isEmpty() || line.startsWith(QLatin1Char('#'))) {
            continue;
        }
        const QString problem = cut(line.split(QLatin1Char(' ')), QDir(QFile::decodeName(argv[2])),
            QDir(QFile::decodeName(argv[3])));
        if (!problem.isEmpty()) {
            err << table.fileName() << ':' << number << ": " << problem << '\n';
            result = 1;
        }
    }
    return result;
}
