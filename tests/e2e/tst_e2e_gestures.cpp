// SPDX-License-Identifier: MIT
// A real pointer uses the page "Mouse gestures" of the gallery; what its log holds is the verdict.
#include <QtCore/QElapsedTimer>
#include <QtCore/QFile>
#include <QtCore/QProcess>
#include <QtCore/QRect>
#include <QtCore/QRegularExpression>
#include <QtCore/QTemporaryDir>
#include <QtTest/QtTest>

#include "support/TestCase.h"
#include "support/TestMain.h"

class TestE2eGestures : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();

    void quickClickIsReportedAfterTheDoubleClickInterval();
    void clickHeldPastTheDoubleClickIntervalIsReportedOnRelease();
    void doubleClickIsOneGesture();
    void longPressIsReportedWhileHeldAndLongClickOnRelease();
    void quickDragIsASwipe();
    void slowDragIsAPan();
    void hoverIsReportedOnlyOnceItIsAskedFor();

private:
    using Action = QStringList;

    // All lines of the pad since the last call of forget(), without time; neighbours that are equal count once.
    QStringList padLines() const;
    QByteArray logText() const;
    void forget();
    QRect place(const QString& name) const;
    QPoint inPad(double x, double y) const;
    void pointer(const QStringList& arguments);
    static QStringList to(const QPoint& point);
    static QStringList pad(const QStringList& signalNames);
    bool waitForLines(const QStringList& expected) const;

    QTemporaryDir m_folder;
    QProcess m_gallery;
    qint64 m_seen = 0;
};

#define COMPARE_PAD(...) \
    do { \
        const QStringList wanted = pad({__VA_ARGS__}); \
        waitForLines(wanted); \
        QCOMPARE(padLines(), wanted); \
    } while (false)

static QString word(const char* text)
{
    return QString::fromLatin1(text);
}

QByteArray TestE2eGestures::logText() const
{
    QFile file(m_folder.filePath(QStringLiteral("log.txt")));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

void TestE2eGestures::forget()
{
    m_seen = logText().size();
}

QStringList TestE2eGestures::padLines() const
{
    QStringList result;
    const QStringList lines = QString::fromUtf8(logText().mid(int(m_seen))).split(QLatin1Char('\n'));
    for (const QString& line : lines) {
        const QString text = line.section(QLatin1Char(' '), 1);
        if (!text.startsWith(QLatin1String("pad."))) {
            continue;
        }
        // Positions of hovering depend on which motions the server merges.
        QString signal = text.mid(4);
        signal.remove(QRegularExpression(QStringLiteral("\\(-?\\d+,-?\\d+\\)$")));
        const bool floods = signal.startsWith(QLatin1String("panning")) || signal.startsWith(QLatin1String("moved"));
        if (!floods || result.isEmpty() || result.constLast() != signal) {
            result.append(signal);
        }
    }
    return result;
}

QRect TestE2eGestures::place(const QString& name) const
{
    const QRegularExpression form(QStringLiteral("^# %1 (-?\\d+) (-?\\d+) (\\d+) (\\d+)$").arg(name),
                                  QRegularExpression::MultilineOption);
    QRect result;
    QRegularExpressionMatchIterator it = form.globalMatch(QString::fromUtf8(logText()));
    while (it.hasNext()) {
        const QRegularExpressionMatch match = it.next();
        result = QRect(match.captured(1).toInt(), match.captured(2).toInt(), match.captured(3).toInt(),
                       match.captured(4).toInt());
    }
    return result;
}

QPoint TestE2eGestures::inPad(double x, double y) const
{
    const QRect pad = place(QStringLiteral("pad"));
    return pad.topLeft() + QPoint(int(pad.width() * x), int(pad.height() * y));
}

QStringList TestE2eGestures::to(const QPoint& point)
{
    return {QStringLiteral("mousemove"), QString::number(point.x()), QString::number(point.y())};
}

QStringList TestE2eGestures::pad(const QStringList& signalNames)
{
    QStringList result;
    for (const QString& name : signalNames) {
        const bool isHover = name == QLatin1String("entered") || name == QLatin1String("moved")
            || name == QLatin1String("left");
        result.append(isHover ? name : name + QStringLiteral("(gesturePad)"));
    }
    return result;
}

void TestE2eGestures::pointer(const QStringList& arguments)
{
    // One process for a whole gesture: its own sleeps are steadier than ours between processes.
    QCOMPARE(QProcess::execute(QStringLiteral("xdotool"), arguments), 0);
}

bool TestE2eGestures::waitForLines(const QStringList& expected) const
{
    return QTest::qWaitFor([&] { return padLines().size() >= expected.size(); }, 5000);
}

void TestE2eGestures::initTestCase()
{
    m_gallery.setProcessChannelMode(QProcess::ForwardedChannels);
    m_gallery.start(QStringLiteral(GALLERY_PROGRAM),
                    {QStringLiteral("--page"), QStringLiteral("mouse-gestures"), QStringLiteral("--lang"),
                     QStringLiteral("en"), QStringLiteral("--log"), m_folder.filePath(QStringLiteral("log.txt"))});
    QVERIFY(m_gallery.waitForStarted());
    // The window manager moves the window once more after it is shown.
    QRect last;
    QElapsedTimer unchanged;
    unchanged.start();
    QVERIFY(QTest::qWaitFor(
        [&] {
            const QRect now = place(QStringLiteral("pad"));
            if (now != last) {
                last = now;
                unchanged.restart();
            }
            return now.isValid() && unchanged.elapsed() > 400;
        },
        20000));
    pointer(to(QPoint(1, 1)));
}

void TestE2eGestures::cleanupTestCase()
{
    m_gallery.terminate();
    QVERIFY(m_gallery.waitForFinished(5000));
}

void TestE2eGestures::quickClickIsReportedAfterTheDoubleClickInterval()
{
    forget();
    pointer(to(inPad(0.3, 0.5)) + QStringList{word("sleep"), word("0.05"), word("mousedown"), word("1"), word("sleep"), word("0.05"), word("mouseup"), word("1")});
    COMPARE_PAD(word("pressed"), word("released"), word("clicked"), word("finished"));

    // From the press to the verdict, on the log's own clock.
    QMap<QString, QTime> times;
    const QStringList lines = QString::fromUtf8(logText().mid(int(m_seen))).split(QLatin1Char('\n'));
    for (const QString& line : lines) {
        times.insert(line.section(QLatin1Char('.'), -1).section(QLatin1Char('('), 0, 0),
                     QTime::fromString(line.left(12), QStringLiteral("HH:mm:ss.zzz")));
    }
    const int elapsed = times.value(word("pressed")).msecsTo(times.value(word("clicked")));
    QVERIFY2(elapsed >= QApplication::doubleClickInterval() * 9 / 10, qPrintable(QString::number(elapsed)));
}

void TestE2eGestures::clickHeldPastTheDoubleClickIntervalIsReportedOnRelease()
{
    forget();
    pointer(to(inPad(0.35, 0.5)) + QStringList{word("sleep"), word("0.05"), word("mousedown"), word("1"), word("sleep"), word("0.65"), word("mouseup"), word("1")});
    COMPARE_PAD(word("pressed"), word("released"), word("clicked"), word("finished"));
}

void TestE2eGestures::doubleClickIsOneGesture()
{
    forget();
    pointer(to(inPad(0.4, 0.5)) + QStringList{word("sleep"), word("0.05"), word("click"), word("--repeat"), word("2"), word("--delay"), word("40"), word("1")});
    COMPARE_PAD(word("pressed"), word("released"), word("released"), word("doubleClicked"), word("finished"));
}

void TestE2eGestures::longPressIsReportedWhileHeldAndLongClickOnRelease()
{
    forget();
    pointer(to(inPad(0.5, 0.6)) + QStringList{word("sleep"), word("0.05"), word("mousedown"), word("1")});
    COMPARE_PAD(word("pressed"), word("longPressed"));
    // A release right at the border may still be a click, since timers may come a little early.
    pointer({word("sleep"), word("0.2"), word("mouseup"), word("1")});
    COMPARE_PAD(word("pressed"), word("longPressed"), word("released"), word("longClicked"), word("finished"));
}

void TestE2eGestures::quickDragIsASwipe()
{
    forget();
    pointer(to(inPad(0.2, 0.5)) + QStringList{word("sleep"), word("0.05"), word("mousedown"), word("1"), word("sleep"), word("0.04")}
            + to(inPad(0.35, 0.5)) + QStringList{word("sleep"), word("0.04")} + to(inPad(0.6, 0.5))
            + QStringList{word("sleep"), word("0.04"), word("mouseup"), word("1")});
    COMPARE_PAD(word("pressed"), word("panning"), word("released"), word("swiped"), word("finished"));
}

void TestE2eGestures::slowDragIsAPan()
{
    forget();
    pointer(to(inPad(0.7, 0.7)) + QStringList{word("sleep"), word("0.05"), word("mousedown"), word("1"), word("sleep"), word("0.1")}
            + to(inPad(0.6, 0.6)) + QStringList{word("sleep"), word("0.6")} + to(inPad(0.5, 0.4))
            + QStringList{word("sleep"), word("0.5"), word("mouseup"), word("1")});
    COMPARE_PAD(word("pressed"), word("panning"), word("released"), word("panned"), word("finished"));
}

void TestE2eGestures::hoverIsReportedOnlyOnceItIsAskedFor()
{
    forget();
    // The press keeps its own pair of signals apart from the silence before it.
    pointer(to(inPad(0.3, 0.4)) + QStringList{word("sleep"), word("0.05")} + to(inPad(0.4, 0.4)) + QStringList{word("sleep"), word("0.05")}
            + to(place(QStringLiteral("hover")).center()) + QStringList{word("sleep"), word("0.05")});
    QCOMPARE(padLines(), QStringList());

    pointer(QStringList{word("mousemove")} + to(place(QStringLiteral("hover")).topLeft() + QPoint(8, place(QStringLiteral("hover")).height() / 2)).mid(1)
            + QStringList{word("click"), word("1"), word("sleep"), word("0.1")} + to(inPad(0.4, 0.4)) + QStringList{word("sleep"), word("0.1")}
            + to(inPad(0.6, 0.6)) + QStringList{word("sleep"), word("0.1")} + to(place(QStringLiteral("hover")).center()));
    COMPARE_PAD(word("entered"), word("moved"), word("left"));
}

ZELKOV_TEST_MAIN(TestE2eGestures)
#include "tst_e2e_gestures.moc"
