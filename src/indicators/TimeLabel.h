// SPDX-License-Identifier: MIT
// The overlay that tells when and where the frame of a picture was taken.
#pragma once

#include "foundation/Export.h"

#include <QtCore/QDateTime>
#include <QtCore/QPoint>
#include <QtCore/QString>
#include <QtGui/QFont>
#include <QtWidgets/QWidget>

class QLabel;

namespace vx
{
class ClickHelper;
class DateTimeEdit;

/// The overlay on a live or recorded picture: a symbol that tells where the picture comes from, the date and time of
/// the frame, which can be edited, and how far it lies from an anchor time. Its font is the largest that fits into the
/// parent's width and the given height.
///
/// Frame times and anchor times are microseconds since the epoch, and all bits set means no time; without a time and
/// without a text to show in its place the label collapses to height 0. It does not place itself: put it where the
/// properties "overlaypos" and "overlaymargin" say on reposTimeLabel(), and move it on the mouse moves that it ignores
/// between labelGrabbed(true) and labelGrabbed(false).
///
/// Object names for style sheets: "FrameTimeWidget", "FrameTimeLabel" and "DateEdit"; the symbol's is its state, by
/// which the style sheet chooses the picture: "FrameTimeGrabberCamera", "FrameTimeGrabberFileserver" or
/// "FrameTimeGrabberError".
class ZELKOV_WIDGETS_EXPORT TimeLabel : public QWidget
{
    Q_OBJECT

public:
    /// Starts hidden. \a recording true chooses the camera's symbol, false the file server's.
    explicit TimeLabel(bool recording, QWidget* parent = nullptr);
    ~TimeLabel() override;

    /// Shows or hides the label. \a maxHeight is the largest height of a line in pixels, \a margin goes to the
    /// property "overlaymargin" and \a position to "overlaypos". With \a forceShow a frame without time shows dashes.
    /// The height is 0 until the next refresh; the frame time that is shown already gives none.
    void showFrametime(bool show, quint64 frameTime, int maxHeight, int margin, bool readOnly, Qt::Alignment position,
        bool forceShow);
    /// Fits everything anew, for instance after a resize of the parent. Emits reposTimeLabel(false) if \a reposition.
    void resizeContent(bool reposition);
    /// A text in place of the difference, until there is a frame time again.
    void setErrorText(const QString& text);
    /// The error symbol outranks the other two.
    void showErrorSymbol(bool on);
    /// True for the camera's symbol, false for the file server's.
    void changeRecordingSymbol(bool on);
    /// Whether a frame without time shows dashes.
    void setForceShow(bool on);
    /// Whether the time can be edited.
    void setReadOnly(bool readOnly);
    /// For events that reached the overlay in place of the edit: sent to the edit, ignored while it is read-only.
    void handleEvents(QEvent* event);
    DateTimeEdit* getDateTimeEit() const; //!< spelled so: clients rely on it

public Q_SLOTS:
    /// Microseconds since the epoch; all bits set mean no time. The time that is shown already does nothing.
    void setFrametime(qulonglong time);
    /// The time that the difference counts from, likewise.
    void setAnchortime(qulonglong time);

Q_SIGNALS:
    /// Place the label: true puts it back to its configured place (after a double click), false keeps the place it has
    /// been moved to (its size may have changed).
    void reposTimeLabel(bool);
    /// The user entered another time.
    void frametimeUpdate(QDateTime);
    /// Pressed (true) and released (false).
    void labelGrabbed(bool);
    /// Clicked without having been moved.
    void symbolClicked();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void showEvent(QShowEvent* event) override;

private Q_SLOTS:
    void frameTimeChanged();
    void onClick();
    void onDoubleClick();

private:
    void refresh(bool reposition);
    void calcTimeDiffs();
    bool showsSecond(quint32 second) const;
    void showSecond(quint32 second);
    void forgetShown();
    int textWidth(const QFont& font, const QString& text, int part);
    void calcSizes();
    void arrangeWidgets();
    void nameSymbol(const QString& name);

    QPoint m_pressPos; // own coordinates
    int m_maxHeight = 0;
    int m_lineHeight = 0;
    int m_fontPointSize = 0;
    int m_overlayPos;
    quint64 m_anchorTime;
    quint64 m_frameTime;
    QLabel* m_symbolLabel = nullptr;
    QLabel* m_timeDiffLabel = nullptr;
    DateTimeEdit* m_dateTimeEdit = nullptr;
    bool m_pressed = false;
    bool m_moved = false;
    bool m_forceShow = false;
    bool m_recording;
    bool m_errorSymbol = false;
    ClickHelper* m_clickHelper = nullptr;
    QString m_errorText;
    // What the present sizes were found for: a frame of the same second needs no new search.
    QString m_sizedText;
    int m_sizedWidth = -1;
    int m_sizedMaxHeight = -1;
    QFont m_sizedFont;
    // What the edit shows if nobody else has touched it: a frame of the same second leaves it alone, since setting its
    // time repaints it even if nothing changes.
    qint64 m_shownSecond = -1;
    QDateTime m_shownTime;
    QString m_shownText;
    // The widths of the texts of edit and difference.
    QFont m_measuredFonts[2];
    QString m_measuredTexts[2];
    int m_measuredWidths[2] = {-1, -1};
    DateTimeEdit** m_rescuedEdit = nullptr; // where the destructor leaves the edit that is in its own signal
};
}
