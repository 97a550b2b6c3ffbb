// SPDX-License-Identifier: MIT
#include "indicators/TimeLabel.h"

#include "CoreQt/Connect.h"
#include "ZelkovUtils/ClickHelper.h"
#include "ZelkovUtils/TimeUtils.h"
#include "controls/DateTimeEdit.h"
#include "indicators/TimeDifference.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QPointer>
#include <QtGui/QFontMetrics>
#include <QtGui/QMouseEvent>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QStyle>

namespace vx
{
namespace
{
QString timeLabelSymbolName(bool recording)
{
    return recording ? QStringLiteral("FrameTimeGrabberCamera") : QStringLiteral("FrameTimeGrabberFileserver");
}

// Clicks and double clicks, by the number that every platform knows.
constexpr int timeLabelClicks = 3;

// The symbols are drawn 94 wide and 108 high.
int timeLabelSymbolWidth(int height)
{
    return height * 94 / 108;
}
}

TimeLabel::TimeLabel(bool recording, QWidget* parent)
    : QWidget(parent)
    , m_overlayPos(static_cast<int>(Qt::AlignHCenter | Qt::AlignBottom))
    , m_anchorTime(c_NoFrameTime)
    , m_frameTime(c_NoFrameTime)
    , m_recording(recording)
{
    m_clickHelper = new ClickHelper(this, timeLabelClicks);
    setObjectName(QStringLiteral("FrameTimeWidget"));
    m_symbolLabel = new QLabel(this);
    m_symbolLabel->setObjectName(timeLabelSymbolName(recording));
    m_symbolLabel->setScaledContents(true);
    m_dateTimeEdit = new DateTimeEdit(this);
    m_dateTimeEdit->setObjectName(QStringLiteral("DateEdit"));
    m_dateTimeEdit->setButtonSymbols(QAbstractSpinBox::NoButtons);
    m_dateTimeEdit->setDisplayFormat(TimeUtils::getDateTimeFormat(true, true));
    m_dateTimeEdit->setAlignment(Qt::AlignHCenter);
    m_dateTimeEdit->setFrame(false);
    m_dateTimeEdit->setKeyboardTracking(false);
    m_dateTimeEdit->m_returnLeavesField = true;
    m_dateTimeEdit->hide();
    vx::connect(m_dateTimeEdit, "2editingFinished()", this, "1frameTimeChanged()", Qt::AutoConnection);
    m_timeDiffLabel = new QLabel(this);
    m_timeDiffLabel->setObjectName(QStringLiteral("FrameTimeLabel"));
    hide();
    m_clickHelper->setReceiver(this);
    m_clickHelper->setActive(true);
    vx::connect(m_clickHelper, "2clicked(const QPointF&)", this, "1onClick()", Qt::AutoConnection);
    vx::connect(m_clickHelper, "2doubleClicked(const QPointF&)", this, "1onDoubleClick()", Qt::AutoConnection);
}

TimeLabel::~TimeLabel()
{
    if (m_rescuedEdit) {
        m_dateTimeEdit->disconnect(this);
        m_dateTimeEdit->hide();
        m_dateTimeEdit->setParent(nullptr);
        *m_rescuedEdit = m_dateTimeEdit;
    }
}

void TimeLabel::showFrametime(bool show, quint64 frameTime, int maxHeight, int margin, bool readOnly,
    Qt::Alignment position, bool forceShow)
{
    const QPointer<TimeLabel> alive(this);
    setVisible(show);
    if (!alive) {
        return;
    }
    setFixedHeight(0);
    if (!show) {
        return;
    }
    setProperty("overlaypos", static_cast<int>(position));
    setProperty("overlaymargin", margin);
    m_dateTimeEdit->setReadOnly(readOnly);
    m_forceShow = forceShow;
    m_maxHeight = maxHeight;
    m_overlayPos = static_cast<int>(position);
    setFrametime(frameTime);
}

void TimeLabel::setFrametime(qulonglong time)
{
    if (m_frameTime != c_NoFrameTime && m_frameTime == time) {
        return;
    }
    m_frameTime = time;
    if (time != c_NoFrameTime) {
        m_dateTimeEdit->show();
        m_errorText.clear();
    } else {
        m_dateTimeEdit->hide();
        if (m_forceShow) {
            m_errorText = QStringLiteral("--- --.--.-- --:--:--");
        } else {
            m_errorText.clear();
        }
    }
    refresh(true);
}

void TimeLabel::setAnchortime(qulonglong time)
{
    if (m_anchorTime == time) {
        return;
    }
    m_anchorTime = time;
    forgetShown();
    refresh(true);
}

void TimeLabel::setErrorText(const QString& text)
{
    m_errorText = text;
    forgetShown();
    refresh(true);
}

void TimeLabel::resizeContent(bool reposition)
{
    forgetShown();
    refresh(reposition);
}

void TimeLabel::setForceShow(bool on)
{
    m_forceShow = on;
}

void TimeLabel::setReadOnly(bool readOnly)
{
    m_dateTimeEdit->setReadOnly(readOnly);
}

DateTimeEdit* TimeLabel::getDateTimeEit() const
{
    return m_dateTimeEdit;
}

void TimeLabel::refresh(bool reposition)
{
    if (!isVisible()) {
        return;
    }
    if (m_frameTime == c_NoFrameTime && m_errorText.isEmpty()) {
        setFixedHeight(0);
        return;
    }
    calcTimeDiffs();
    calcSizes();
    if (m_lineHeight < 12) {
        m_lineHeight = 0; // unreadable: gone
    }
    arrangeWidgets();
    if (reposition) {
        Q_EMIT reposTimeLabel(false);
    }
}

void TimeLabel::calcTimeDiffs()
{
    const QString text = m_errorText.isEmpty() ? frameTimeDifference(m_frameTime, m_anchorTime) : m_errorText;
    const quint32 second = static_cast<quint32>(m_frameTime / 1000000);
    if (!showsSecond(second)) {
        showSecond(second);
    }
    m_timeDiffLabel->setText(text);
}

bool TimeLabel::showsSecond(quint32 second) const
{
    return m_shownSecond == second && !m_dateTimeEdit->lineEdit()->isModified()
        && m_dateTimeEdit->text() == m_shownText && m_dateTimeEdit->dateTime() == m_shownTime;
}

void TimeLabel::showSecond(quint32 second)
{
    const QDateTime time = frameDateTime(m_frameTime);
    m_dateTimeEdit->setDateTime(time);
    m_shownTime = m_dateTimeEdit->dateTime();
    m_shownText = m_dateTimeEdit->text();
    // Out of the range of the edit: tried anew each time.
    m_shownSecond = m_shownTime == time ? qint64(second) : -1;
}

void TimeLabel::forgetShown()
{
    m_shownSecond = -1;
    m_measuredWidths[0] = m_measuredWidths[1] = -1;
}

int TimeLabel::textWidth(const QFont& font, const QString& text, int part)
{
    if (m_measuredWidths[part] < 0 || text != m_measuredTexts[part] || font != m_measuredFonts[part]) {
        m_measuredTexts[part] = text;
        m_measuredFonts[part] = font;
        m_measuredWidths[part] = QFontMetrics(font).horizontalAdvance(text);
    }
    return m_measuredWidths[part];
}

void TimeLabel::calcSizes()
{
    const QWidget* const around = parentWidget();
    if (m_maxHeight < 4 || !around) {
        return;
    }
    const QString text = m_dateTimeEdit->text() + m_timeDiffLabel->text();
    QFont font = m_timeDiffLabel->font();
    if (text == m_sizedText && around->width() == m_sizedWidth && m_maxHeight == m_sizedMaxHeight
        && font == m_sizedFont) {
        return;
    }
    m_sizedText = text;
    m_sizedWidth = around->width();
    m_sizedMaxHeight = m_maxHeight;
    m_sizedFont = font;
    for (int size = 3; size < m_maxHeight; ++size) {
        font.setPointSize(size);
        const QFontMetrics metrics(font);
        const int height = metrics.height();
        if (metrics.horizontalAdvance(text) + timeLabelSymbolWidth(height) + 10 <= around->width()
            && height <= m_maxHeight) {
            continue;
        }
        // The height of the size that failed, the font of the one before.
        m_lineHeight = height;
        m_fontPointSize = size - 1;
        font.setPointSize(m_fontPointSize);
        m_timeDiffLabel->setFont(font);
        m_sizedFont = m_timeDiffLabel->font();
        QFont editFont = m_dateTimeEdit->font();
        editFont.setPointSize(m_fontPointSize);
        m_dateTimeEdit->setFont(editFont);
        editFont = m_dateTimeEdit->getFont();
        editFont.setPointSize(m_fontPointSize);
        m_dateTimeEdit->changeFont(editFont);
        return;
    }
}

void TimeLabel::arrangeWidgets()
{
    const int symbolWidth = timeLabelSymbolWidth(m_lineHeight);
    m_symbolLabel->setGeometry(0, 0, symbolWidth, m_lineHeight);
    const QFont font = m_dateTimeEdit->getFont();
    const int editWidth = m_dateTimeEdit->isVisible() ? textWidth(font, m_dateTimeEdit->text(), 0) + 5 : 0;
    m_dateTimeEdit->setGeometry(symbolWidth, 0, editWidth, m_lineHeight);
    const QString difference = m_timeDiffLabel->text();
    const int differenceWidth = difference.isEmpty() ? 0 : textWidth(font, difference, 1) + 5;
    m_timeDiffLabel->setGeometry(symbolWidth + editWidth, 0, differenceWidth, m_lineHeight);
    setFixedSize(symbolWidth + editWidth + differenceWidth, m_lineHeight);
}

void TimeLabel::frameTimeChanged()
{
    if (m_dateTimeEdit->isReadOnly()) {
        return;
    }
    const QDateTime time = m_dateTimeEdit->dateTime();
    m_frameTime = static_cast<quint64>(secondsOfTime(time)) * 1000000;
    // The edit is in the middle of a key event and goes on with it after this: it has to outlive a label that is
    // deleted by a slot.
    DateTimeEdit* rescued = nullptr;
    DateTimeEdit** const outer = m_rescuedEdit;
    const QPointer<TimeLabel> alive(this);
    if (!outer) {
        m_rescuedEdit = &rescued;
    }
    Q_EMIT frametimeUpdate(time);
    if (alive) {
        m_rescuedEdit = outer;
    } else if (rescued) {
        rescued->deleteLater();
    }
}

void TimeLabel::handleEvents(QEvent* event)
{
    m_dateTimeEdit->m_returnLeavesField = false;
    if (m_dateTimeEdit->isReadOnly()) {
        event->ignore();
    } else {
        QCoreApplication::sendEvent(m_dateTimeEdit, event);
    }
}

void TimeLabel::nameSymbol(const QString& name)
{
    m_symbolLabel->style()->unpolish(m_symbolLabel);
    m_symbolLabel->setObjectName(name);
    m_symbolLabel->style()->polish(m_symbolLabel);
}

void TimeLabel::changeRecordingSymbol(bool on)
{
    m_recording = on;
    if (m_errorSymbol) {
        return;
    }
    const QString name = timeLabelSymbolName(on);
    if (m_symbolLabel->objectName() != name) {
        nameSymbol(name);
    }
}

void TimeLabel::showErrorSymbol(bool on)
{
    m_errorSymbol = on;
    if (on) {
        nameSymbol(QStringLiteral("FrameTimeGrabberError"));
    } else {
        changeRecordingSymbol(m_recording);
    }
}

void TimeLabel::mousePressEvent(QMouseEvent* event)
{
    m_pressPos = event->pos();
    const QPointer<TimeLabel> alive(this);
    Q_EMIT labelGrabbed(true);
    if (!alive) {
        return;
    }
    m_pressed = true;
    m_moved = false;
    event->accept();
}

void TimeLabel::mouseMoveEvent(QMouseEvent* event)
{
    if (m_pressed) {
        m_moved = true;
        setCursor(Qt::ClosedHandCursor);
    } else {
        setCursor(Qt::OpenHandCursor);
    }
    event->ignore(); // the client's handler moves the label
}

void TimeLabel::mouseReleaseEvent(QMouseEvent* event)
{
    m_pressed = false;
    event->accept();
    Q_EMIT labelGrabbed(false);
}

void TimeLabel::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    forgetShown();
    refresh(true);
}

void TimeLabel::onClick()
{
    if (m_moved) {
        m_moved = false;
        return;
    }
    const QPointer<TimeLabel> alive(this);
    Q_EMIT symbolClicked();
    if (alive) {
        m_moved = false;
    }
}

void TimeLabel::onDoubleClick()
{
    setProperty("overlaypos", m_overlayPos);
    Q_EMIT reposTimeLabel(true);
}
}
