// SPDX-License-Identifier: MIT
// A real pointer uses the page "Time line" of the gallery; what its log holds is the verdict.
#include <QtCore/QElapsedTimer>
#include <QtCore/QFile>
#include <QtCore/QProcess>
#include <QtCore/QRect>
#include <QtCore/QRegularExpression>
#include <QtCore/QTemporaryDir>
#include <QtTest/QtTest>

#include "support/TestCase.h"
#include "support/TestMain.h"

namespace
{
constexpr int c_moment = 1; // the handle of the moment that is shown
constexpr int c_noon = 43200;
constexpr int c_handleSize = 24;
constexpr int c_day = 86400;

QStringList words(std::initializer_list<const char*> list)
{
    QStringList result;
    for (const char* word : list) {
        result << QString::fromLatin1(word);
    }
    return result;
}
}

class TestE2eTimeline : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();

    void aDragAlongTheBarGoesWithThePointer();
    void aScrubFarFromTheBarGoesBySeconds();
    void aClickOnAFlagIsTheFlags();

private:
    // What the day's slider has said since the last call of forget(), without time and layout.
    QStringList lines() const;
    // The last value of that handle since then, or -1.
    int lastValue(int handle) const;
    QByteArray logText() const;
    void forget() { m_seen = logText().size(); }
    QRect place(const QString& name) const;
    // Where that second of the day stands on the line.
    QPoint onLine(int seconds) const;
    static QStringList to(const QPoint& point);
    static QStringList pause(const char* seconds) { return words({"sleep", seconds}); }
    void pointer(const QStringList& arguments);
    // The pixels of a drag along the bar that make so many seconds.
    double secondsPerPixel() const;
    bool waitFor(const QString& line) const;

    QTemporaryDir m_folder;
    QProcess m_gallery;
    qint64 m_seen = 0;
};

QByteArray TestE2eTimeline::logText() const
{
    QFile file(m_folder.filePath(QStringLiteral("log.txt")));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

QStringList TestE2eTimeline::lines() const
{
    QStringList result;
    const QStringList all = QString::fromUtf8(logText().mid(int(m_seen))).split(QLatin1Char('\n'));
    for (const QString& line : all) {
        const QString text = line.section(QLatin1Char(' '), 1);
        if (text.startsWith(QLatin1String("day.")) && !text.contains(QLatin1String("RepaintQueued"))) {
            result << text.mid(4).remove(QLatin1Char(' '));
        }
    }
    return result;
}

int TestE2eTimeline::lastValue(int handle) const
{
    const QRegularExpression form(QStringLiteral("^nubsieValueChangedByUser\\(%1,(\\d+)\\)").arg(handle));
    int result = -1;
    for (const QString& line : lines()) {
        const QRegularExpressionMatch match = form.match(line);
        if (match.hasMatch()) {
            result = match.captured(1).toInt();
        }
    }
    return result;
}

QRect TestE2eTimeline::place(const QString& name) const
{
    const QRegularExpression form(
        QStringLiteral("^# %1 (-?\\d+) (-?\\d+) (\\d+) (\\d+)$").arg(name), QRegularExpression::MultilineOption);
    QRect result;
    QRegularExpressionMatchIterator it = form.globalMatch(QString::fromUtf8(logText()));
    while (it.hasNext()) {
        const QRegularExpressionMatch match = it.next();
        result = QRect(match.captured(1).toInt(), match.captured(2).toInt(), match.captured(3).toInt(),
            match.captured(4).toInt());
    }
    return result;
}

double TestE2eTimeline::secondsPerPixel() const
{
    return double(c_day) / (place(QStringLiteral("day")).width() - c_handleSize);
}

QPoint TestE2eTimeline::onLine(int seconds) const
{
    const QRect day = place(QStringLiteral("day"));
    return QPoint(
        day.left() + c_handleSize / 2 - 1 + int(seconds / secondsPerPixel()), day.top() + day.height() / 2 - 5);
}

QStringList TestE2eTimeline::to(const QPoint& point)
{
    return {QStringLiteral("mousemove"), QString::number(point.x()), QString::number(point.y())};
}

void TestE2eTimeline::pointer(const QStringList& arguments)
{
    QCOMPARE(QProcess::execute(QStringLiteral("xdotool"), arguments), 0);
}

bool TestE2eTimeline::waitFor(const QString& line) const
{
    return QTest::qWaitFor([&] { return lines().contains(line); }, 5000);
}

void TestE2eTimeline::initTestCase()
{
    m_gallery.setProcessChannelMode(QProcess::ForwardedChannels);
    m_gallery.start(QStringLiteral(GALLERY_PROGRAM),
        {QStringLiteral("--page"), QStringLiteral("time-line"), QStringLiteral("--lang"), QStringLiteral("en"),
            QStringLiteral("--log"), m_folder.filePath(QStringLiteral("log.txt"))});
    QVERIFY(m_gallery.waitForStarted());
    // The window manager moves the window once more after it is shown.
    QRect last;
    QElapsedTimer unchanged;
    unchanged.start();
    QVERIFY(QTest::qWaitFor(
        [&] {
            const QRect now = place(QStringLiteral("day"));
            if (now != last) {
                last = now;
                unchanged.restart();
            }
            return now.isValid() && unchanged.elapsed() > 400;
        },
        20000));
    pointer(to(QPoint(1, 1)));
}

void TestE2eTimeline::cleanupTestCase()
{
    m_gallery.terminate();
    QVERIFY(m_gallery.waitForFinished(5000));
}

void TestE2eTimeline::aDragAlongTheBarGoesWithThePointer()
{
    forget();
    const QPoint start = onLine(c_noon);
    pointer(to(start) + pause("0.1") + words({"mousedown", "1"}) + pause("0.2") + to(start + QPoint(20, 0))
        + pause("0.05") + to(start + QPoint(60, 3)) + pause("0.05") + to(start + QPoint(100, 5)) + pause("0.1")
        + words({"mouseup", "1"}));
    QVERIFY(waitFor(QStringLiteral("nubsieDragEnded(%1)").arg(c_moment)));
    const QStringList said = lines();
    QCOMPARE(said.constFirst(), QStringLiteral("nubsieDragStarted(%1)").arg(c_moment));
    // One to one, to a pixel or two.
    const double moved = lastValue(c_moment) - c_noon;
    QVERIFY2(qAbs(moved - 100 * secondsPerPixel()) < 2.5 * secondsPerPixel(), qPrintable(QString::number(moved)));
}

void TestE2eTimeline::aScrubFarFromTheBarGoesBySeconds()
{
    const int before = lastValue(c_moment);
    QVERIFY(before > 0);
    forget();
    const QPoint start = onLine(before);
    // A first step near the bar, then straight away from it, then along: the last one counts.
    const QPoint away(start.x() + 4, place(QStringLiteral("day")).top() - 330);
    pointer(to(start) + pause("0.1") + words({"mousedown", "1"}) + pause("0.2") + to(start + QPoint(4, 0))
        + pause("0.1") + to(away) + pause("0.2"));
    QTRY_VERIFY(lastValue(c_moment) > 0);
    const int far = lastValue(c_moment);
    pointer(to(away + QPoint(20, 0)) + pause("0.1") + to(away + QPoint(40, 0)) + pause("0.2")
        + words({"mouseup", "1"}));
    QVERIFY(waitFor(QStringLiteral("nubsieDragEnded(%1)").arg(c_moment)));
    const int moved = lastValue(c_moment) - far;
    // Slower than the pointer, and still in its direction.
    QVERIFY2(moved > 0, qPrintable(QString::number(moved)));
    QVERIFY2(moved < 0.6 * 40 * secondsPerPixel(), qPrintable(QString::number(moved)));
}

void TestE2eTimeline::aClickOnAFlagIsTheFlags()
{
    forget();
    const QRect flag = place(QStringLiteral("firstFlag"));
    QVERIFY(flag.isValid());
    const QPoint cloth = flag.topLeft() + QPoint(flag.width() / 2, flag.height() / 4);
    pointer(to(cloth) + pause("0.1") + words({"click", "1"}) + pause("0.7"));
    QVERIFY(waitFor(QStringLiteral("firstFlagClicked()")));
    QCOMPARE(lines(), words({"firstFlagClicked()"}));

    forget();
    pointer(to(cloth) + words({"click", "3"}));
    QVERIFY(waitFor(QStringLiteral("firstFlagRightClicked()")));
    QCOMPARE(lines(), words({"firstFlagRightClicked()"}));
}

ZELKOV_TEST_MAIN(TestE2eTimeline)
#include "tst_e2e_timeline.moc"
