// SPDX-License-Identifier: MIT
// The label that shortens its text, compared with widgets that draw the text that it should show.
#include "indicators/ElidedLabel.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtGui/QPainter>
#include <QtTest/QtTest>

#include <climits>

namespace
{
const QString c_sentence = QStringLiteral("The camera in the main entrance does not answer any more");

/// Draws a given text in a given rectangle, in the same surroundings.
class Reference : public QFrame
{
public:
    Reference(QLabel& original, const QRect& rect, int flags, const QString& text)
        : m_rect(rect)
        , m_flags(flags)
        , m_text(text)
    {
        resize(original.size());
        setFrameStyle(original.frameStyle());
        setLineWidth(original.lineWidth());
        setFont(original.font());
        setLayoutDirection(original.layoutDirection());
        setPalette(original.palette());
        setEnabled(original.isEnabled());
        setStyleSheet(original.styleSheet());
    }

protected:
    void paintEvent(QPaintEvent* event) override
    {
        QFrame::paintEvent(event);
        QPainter painter(this);
        painter.drawText(m_rect, m_flags, m_text);
    }

private:
    QRect m_rect;
    int m_flags;
    QString m_text;
};

QImage frame(QWidget& widget)
{
    return widget.grab().toImage();
}

/// Whether the label shows just the text in the rectangle; the picture must not be empty.
bool shows(QLabel& label, const QRect& rect, int flags, const QString& text)
{
    Reference reference(label, rect, flags, text);
    Reference empty(label, rect, flags, QString());
    const QImage image = frame(label);
    return image == frame(reference) && (text.isEmpty() || image != frame(empty));
}
}

class TestElidedLabel : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void itStartsWithItsDefaults()
    {
        QWidget parent;
        vx::ElidedLabel label(&parent, Qt::WindowFlags());
        QCOMPARE(label.parentWidget(), &parent);
        QCOMPARE(label.text(), QString());
        vx::ElidedLabel window(c_sentence, nullptr, Qt::Tool);
        QCOMPARE(window.text(), c_sentence);
        QVERIFY(window.windowFlags().testFlag(Qt::Tool));
    }

    void oneLineIsCutAtItsEnd()
    {
        vx::ElidedLabel label(c_sentence);
        label.resize(120, 24);
        const QString cut = label.fontMetrics().elidedText(c_sentence, Qt::ElideRight, 120);
        QVERIFY(cut.endsWith(QChar(0x2026)) && cut.startsWith(QLatin1String("The camera")));
        QVERIFY(shows(label, label.rect(), int(label.alignment()), cut));
        QCOMPARE(label.text(), c_sentence);
    }

    void allModesAndAlignmentsArePainted_data()
    {
        QTest::addColumn<int>("mode");
        QTest::addColumn<int>("alignment");
        QTest::addColumn<int>("indent");
        const QVector<QPair<const char*, int>> across = {{"left", Qt::AlignLeft}, {"right", Qt::AlignRight},
            {"centre", Qt::AlignHCenter}, {"justify", Qt::AlignJustify}};
        const QVector<QPair<const char*, int>> down
            = {{"top", Qt::AlignTop}, {"bottom", Qt::AlignBottom}, {"centre", Qt::AlignVCenter}};
        const QVector<QPair<const char*, int>> modes = {{"left", Qt::ElideLeft}, {"right", Qt::ElideRight},
            {"middle", Qt::ElideMiddle}, {"none", Qt::ElideNone}};
        for (const auto& mode : modes) {
            for (const auto& x : across) {
                for (const auto& y : down) {
                    for (const int indent : {-1, 0, 9}) {
                        QTest::addRow("elide %s, %s, %s, indent %d", mode.first, x.first, y.first, indent)
                            << mode.second << (x.second | y.second) << indent;
                    }
                }
            }
        }
    }

    void allModesAndAlignmentsArePainted()
    {
        QFETCH(int, mode);
        QFETCH(int, alignment);
        QFETCH(int, indent);
        vx::ElidedLabel label(c_sentence);
        label.resize(130, 60);
        label.setFrameStyle(QFrame::Box | QFrame::Plain);
        label.setLineWidth(2);
        label.setElideMode(Qt::TextElideMode(mode));
        label.setAlignment(Qt::Alignment(QFlag(alignment)));
        label.setIndent(indent);
        QRect room(2, 2, 126, 56);
        if (indent > 0) {
            room.adjust(alignment & Qt::AlignLeft ? indent : 0, alignment & Qt::AlignTop ? indent : 0,
                alignment & Qt::AlignRight ? -indent : 0, alignment & Qt::AlignBottom ? -indent : 0);
        }
        const QString cut = label.fontMetrics().elidedText(c_sentence, Qt::TextElideMode(mode), room.width());
        QVERIFY(shows(label, room, alignment, cut));
    }

    void aTextThatFitsIsWhole()
    {
        vx::ElidedLabel label(QStringLiteral("Short"));
        const int width = label.fontMetrics().size(0, label.text()).width();
        label.resize(width, 24);
        QVERIFY(shows(label, label.rect(), int(label.alignment()), QStringLiteral("Short")));
        label.resize(width - 1, 24);
        QVERIFY(!shows(label, label.rect(), int(label.alignment()), QStringLiteral("Short")));
        label.setText(QString());
        QVERIFY(shows(label, label.rect(), int(label.alignment()), QString()));
    }

    void theMarginOfTheLabelDoesNotCount()
    {
        vx::ElidedLabel label(QStringLiteral("Short"));
        label.resize(120, 24);
        label.setMargin(10);
        QVERIFY(shows(label, label.rect(), int(label.alignment()), QStringLiteral("Short")));
        label.setContentsMargins(11, 2, 5, 1);
        QVERIFY(shows(label, QRect(11, 2, 104, 21), int(label.alignment()), QStringLiteral("Short")));
    }

    void aLongSentenceOfShortWordsWrapsWhole()
    {
        vx::ElidedLabel label(c_sentence);
        label.setWordWrap(true);
        label.resize(120, 90);
        QVERIFY(label.fontMetrics().size(Qt::TextWordWrap, c_sentence).width() <= 120);
        QVERIFY(shows(label, label.rect(), int(label.alignment()) | Qt::TextWordWrap, c_sentence));
    }

    void aWrappedTextThatFitsIsOneLine()
    {
        vx::ElidedLabel label(QStringLiteral("Two words"));
        label.setWordWrap(true);
        const int width = label.fontMetrics().size(0, label.text()).width();
        label.resize(width, 60);
        QVERIFY(shows(label, label.rect(), int(label.alignment()), QStringLiteral("Two words")));
        label.resize(width - 1, 60);
        QVERIFY(
            shows(label, label.rect(), int(label.alignment()) | Qt::TextWordWrap, QStringLiteral("Two words")));
    }

    void onlyTheWordThatIsTooLongIsElided_data()
    {
        QTest::addColumn<int>("mode");
        QTest::newRow("left") << int(Qt::ElideLeft);
        QTest::newRow("right") << int(Qt::ElideRight);
        QTest::newRow("middle") << int(Qt::ElideMiddle);
        QTest::newRow("none") << int(Qt::ElideNone);
    }

    void onlyTheWordThatIsTooLongIsElided()
    {
        QFETCH(int, mode);
        const QString text = QStringLiteral("a  camera Kameraueberwachungsgeraetebezeichnung here ");
        vx::ElidedLabel label(text);
        label.setWordWrap(true);
        label.setElideMode(Qt::TextElideMode(mode));
        label.resize(100, 90);
        const QFontMetrics metrics = label.fontMetrics();
        QVERIFY(metrics.size(0, QStringLiteral("camera")).width() <= 100);
        const QString cut = metrics.elidedText(
            QStringLiteral("Kameraueberwachungsgeraetebezeichnung"), Qt::TextElideMode(mode), 100);
        const QString expected = QStringLiteral("a  camera %1 here ").arg(cut);
        QCOMPARE(expected == text, mode == int(Qt::ElideNone));
        QVERIFY(shows(label, label.rect(), int(label.alignment()) | Qt::TextWordWrap, expected));
        QCOMPARE(label.text(), text);
    }

    void whatIsShownFollowsEveryChange()
    {
        vx::ElidedLabel label(c_sentence);
        label.resize(120, 60);
        const auto isRight = [&](Qt::TextElideMode mode) {
            const QString cut = label.fontMetrics().elidedText(label.text(), mode, label.width());
            return shows(label, label.rect(), int(label.alignment()), cut);
        };
        QVERIFY(isRight(Qt::ElideRight));
        label.resize(150, 60);
        QVERIFY(isRight(Qt::ElideRight));
        label.setText(QStringLiteral("An altogether different text of some length"));
        QVERIFY(isRight(Qt::ElideRight));
        label.setElideMode(Qt::ElideMiddle);
        QVERIFY(isRight(Qt::ElideMiddle));
        QFont font = label.font();
        font.setPixelSize(18);
        label.setFont(font);
        QVERIFY(isRight(Qt::ElideMiddle));
        label.setStyleSheet(QStringLiteral("font-size: 9px; color: red; background: white;"));
        QVERIFY(isRight(Qt::ElideMiddle));
        label.setWordWrap(true);
        QVERIFY(shows(label, label.rect(), int(label.alignment()) | Qt::TextWordWrap, label.text()));
        label.setWordWrap(false);
        QVERIFY(isRight(Qt::ElideMiddle));
    }

    void theModeAloneDoesNotRepaint()
    {
        class Counting : public vx::ElidedLabel
        {
        public:
            int paints = 0;

        protected:
            void paintEvent(QPaintEvent* event) override
            {
                ++paints;
                vx::ElidedLabel::paintEvent(event);
            }
        };
        Counting label;
        label.setText(c_sentence);
        label.resize(100, 24);
        label.show();
        QVERIFY(QTest::qWaitForWindowExposed(&label));
        QTRY_VERIFY(label.paints > 0);
        QCoreApplication::processEvents();
        const int before = label.paints;
        label.setElideMode(Qt::ElideLeft);
        QCoreApplication::processEvents();
        QCoreApplication::processEvents();
        QCOMPARE(label.paints, before);
    }

    void anApplicationFromRightToLeftMirrorsTheAlignment()
    {
        QGuiApplication::setLayoutDirection(Qt::RightToLeft);
        vx::ElidedLabel label(QStringLiteral("Short"));
        label.resize(120, 24);
        const bool mirrored = shows(label, label.rect(),
            int(Qt::AlignRight | Qt::AlignVCenter | Qt::AlignAbsolute), QStringLiteral("Short"));
        QGuiApplication::setLayoutDirection(Qt::LeftToRight);
        QVERIFY(mirrored);
        // The direction of the label alone does not.
        label.setLayoutDirection(Qt::RightToLeft);
        QVERIFY(shows(label, label.rect(), int(Qt::AlignLeft | Qt::AlignVCenter | Qt::AlignAbsolute),
            QStringLiteral("Short")));
    }

    void aDisabledLabelUsesItsPalette()
    {
        vx::ElidedLabel label(c_sentence);
        label.resize(120, 24);
        const QImage enabled = frame(label);
        label.setEnabled(false);
        QVERIFY(frame(label) != enabled);
        QVERIFY(shows(label, label.rect(), int(label.alignment()),
            label.fontMetrics().elidedText(c_sentence, Qt::ElideRight, 120)));
    }

    void extremeIndentsAreHarmless()
    {
        vx::ElidedLabel label(c_sentence);
        label.resize(120, 24);
        for (const int indent : {INT_MIN, -2, 119, 120, 500, INT_MAX}) {
            label.setIndent(indent);
            for (const bool wrap : {false, true}) {
                label.setWordWrap(wrap);
                frame(label);
            }
        }
    }
};

ZELKOV_TEST_MAIN(TestElidedLabel)
#include "tst_elidedlabel.moc"
