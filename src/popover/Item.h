// SPDX-License-Identifier: MIT
// One row of a popover, and the base of all rows.
#pragma once

#include "foundation/Export.h"
#include "popover/PopoverFlags.h"

#include <QtCore/QByteArray>
#include <QtCore/QMap>
#include <QtCore/QPoint>
#include <QtCore/QPointer>
#include <QtCore/QString>
#include <QtCore/QVariant>
#include <QtWidgets/QWidget>

#include <memory>

class ElidedButton;
class QHBoxLayout;
class QTimer;

namespace vx
{
class BadgeWidget;
class ISecurityManager;

namespace PopoverWidget
{

/// One row of a popover: up to three elements (icon, text, additional text), a busy mark, an id, and the rules by
/// which a click becomes itemPerformed(). Subclasses add a control at the right end and react to the mouse
/// release; the base class reacts to double clicks, drags and the state alone. A Container lays rows out, owns
/// them and hands itemPerformed() on.
///
/// Elements are created by the constructor as its flags say, never later: a setter for an element that the item
/// does not have does nothing, and its getter gives an empty value. Icon and text stand at the left, the
/// additional text at the right; with flags 0 the item has no element and no left and right layout, only a main
/// layout for the subclass. Elements do not take the mouse, the item does.
///
/// The base class has no say in what a click means. A subclass asks, in its mouseReleaseEvent(): isProtected(), is
/// the position in rect(), is the button one that performs; then emits itemPerformed() with what
/// getItemPerformedFlag() says.
class ZELKOV_WIDGETS_EXPORT Item : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(int spacing READ spacing WRITE setSpacing)
    Q_PROPERTY(int leftMargin READ leftMargin WRITE setLeftMargin)
    Q_PROPERTY(int rightMargin READ rightMargin WRITE setRightMargin)
    Q_PROPERTY(bool shadow READ shadowEnabled WRITE setEnableShadow)

public:
    /// The format that marks the data of a dragged item; it carries the id as text. "PopoverWidgetItem".
    static const QString sPopoverWidgetItem;

    ~Item() override;

    /// What the container does when it adds the item without flags of its own. The base class: nothing, 0.
    virtual EContainerFlag defaultItemFlags();

    /// Sets the text element, escaped; see ItemRules::escaped(). Emits layoutChanged().
    virtual void setText(const QString& text);
    /// What the text element holds, that is the escaped text.
    virtual QString text();
    /// The base class does nothing.
    virtual void setCurrentText(const QString& text);
    virtual QString currentText();
    /// Sets the additional-text element as it is: here an ampersand is the client's own affair. Emits
    /// layoutChanged().
    virtual void setAdditionalText(const QString& text);
    virtual QString additionalText();
    /// The base class takes strings only, and shows them, escaped, in the additional-text element. Emits
    /// layoutChanged() if it has one.
    virtual void setValue(const QVariant& value);
    /// The base class: the additional text, or a null variant without that element.
    virtual QVariant value();
    virtual QVariant userData();
    /// Whether icon or text element are checked.
    virtual bool isChecked() const;
    /// Checks or unchecks icon and text element. Emits layoutChanged().
    virtual void setChecked(bool checked);
    /// Shows or hides the busy mark, with @p hideLast in place of the last element. Ending it shows that element
    /// again in any case. Emits layoutChanged().
    virtual void setBusy(bool busy, bool hideLast);
    /// Puts a text in place of the busy mark, for instance a count; an empty text hides it. Without @p hideLast
    /// the last element is shown beside it. Emits layoutChanged().
    virtual void setBusyText(const QString& text, bool hideLast);
    /// The widget that takes the focus for the item, or null.
    virtual QWidget* getFocusItem();
    /// Of all elements.
    virtual void setElideMode(Qt::TextElideMode mode);
    /// Ends whatever the item's control animates. The base class does nothing.
    virtual void cancelAnimations();
    /// The content of the popover was scrolled. The base class does nothing.
    virtual void onItemScrolled();
    /// The part of the item under @p pos (own coordinates), with the bit of the button; a position on no element
    /// gives the button alone.
    virtual QFlags<EItemPerformedFlag> getItemPerformedFlag(const QPoint& pos, Qt::MouseButton button);
    /// Emits itemPerformed() with text() as value. The base class always adds eipDoubleClick; subclasses that tell
    /// single from double clicks override this.
    virtual void performSingleClick(QFlags<EItemPerformedFlag> flags);

    /// As given to the constructor; ids need not be unique.
    int id() const;
    /// As given to the constructor.
    QFlags<EItemFlag> itemFlags() const;
    // The elements; null for those that the item was not given.
    ElidedButton* iconElement() const;
    ElidedButton* textElement() const;
    ElidedButton* additionalTextElement() const;
    BadgeWidget* busyWidget() const;

    /// What itemPerformed() carries besides the value; the client's own affair.
    void setUserData(const QVariant& userData);
    /// A text beside the icon, in the icon element, escaped. Emits layoutChanged().
    void setIconText(const QString& text);

    /// Space between the elements, in pixels. Default 5.
    void setSpacing(int spacing);
    int spacing() const;
    // Margins of the row, in pixels.
    void setLeftMargin(int margin);
    int leftMargin() const;
    void setRightMargin(int margin);
    int rightMargin() const;

    /// Gives the icon element a soft shadow, or takes its graphics effect away. Emits layoutChanged().
    void setEnableShadow(bool enable);
    /// Whether the item itself, not its icon, has a graphics effect: stays false after setEnableShadow(true).
    bool shadowEnabled() const;

    /// Gives getFocusItem() the focus, if there is one.
    void setKeyboardFocus();

    /// Lets the item be dragged with the left button. Off by default.
    void setDragEnabled(bool enabled);
    /// The format under which the user data travel in a drag. Default "text/plain".
    void setDragMimeType(const QString& type);
    /// Further formats of a drag; they win over those that the item sets by itself.
    void setDragMimeData(const QMap<QString, QByteArray>& formats);

    /// Only administrators may perform the item. A security manager has to be set before it is first clicked.
    void setAdminOnly(bool adminOnly);
    /// The name of the right that performing the item takes; empty for none. Does not matter with admin only.
    void setSecurityCheck(const QString& right);
    /// The one manager of all items; null at first. CustomClickAdapter has one of its own.
    static void setSecurityManager(std::shared_ptr<vx::ISecurityManager> manager);
    static std::shared_ptr<vx::ISecurityManager> securityManager();

    /// Gives the item a context menu, a popover with this one entry; an empty text takes it away. Needs the Manager.
    void setResetPopover(const QString& text);

    /// Swallows mouse presses and releases of what it is installed on while isProtected(). Clients install it, for
    /// instance on a control; the item does not.
    bool eventFilter(QObject* watched, QEvent* event) override;

Q_SIGNALS:
    /// The item may want another size.
    void layoutChanged();
    /// The user performed the item. @p value is what the subclass has as value at that moment.
    void itemPerformed(
        int itemId, const QVariant& value, const QVariant& userData, vx::PopoverWidget::EItemPerformedFlags flag);
    /// A drag of the item is about to begin. The drag runs in a local event loop right after this.
    void itemDragStarted();
    /// The user asked for the context menu, and setResetPopover() gave the item one; it opens right after.
    void contextMenuRequested(const QPoint& pos);
    /// The one entry of the context menu was chosen.
    void resetContextMenuPerformed();

private Q_SLOTS:
    void openContextMenu(const QPoint& pos);

protected:
    /// The elements that @p flags name, with these texts. An empty @p text gives no text element; with flags that
    /// are exactly eifIcon it goes to the icon element.
    Item(QWidget* parent, QFlags<EItemFlag> flags, int id, const QString& objectName, const QString& text,
        const QString& additionalText);

    /// Whether the present user may not perform the item. Asks the security manager; the answer is kept in
    /// m_protected.
    bool isProtected();
    /// With eifBoldSelection: the font of the text element after isChecked().
    void updateSelectionDrawing();
    /// Calls performSingleClick(@p flags) when no second click has come in the system's double click interval and
    /// 50 milliseconds. The release that ends a double click starts nothing.
    void startDoubleClickTimer(QFlags<EItemPerformedFlag> flags);
    /// Gives up the single click that waits.
    void stopDoubleClickTimer();
    /// performSingleClick() with eipDoubleClick added.
    void performDoubleClick(QFlags<EItemPerformedFlag> flags);

    bool event(QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;

    ElidedButton* m_iconElement = nullptr; ///< null if the item has none
    ElidedButton* m_textElement = nullptr; ///< likewise
    ElidedButton* m_additionalTextElement = nullptr; ///< likewise
    QHBoxLayout* m_mainLayout = nullptr; ///< of the whole row
    QHBoxLayout* m_leftLayout = nullptr; // null with flags 0
    QHBoxLayout* m_rightLayout = nullptr; // null with flags 0
    int m_id; ///< see id()
    QFlags<EItemFlag> m_flags; ///< see itemFlags()
    QVariant m_userData; ///< see setUserData()
    BadgeWidget* m_busyWidget = nullptr; ///< hidden unless busy
    QPointer<QWidget> m_lastElement; // what the busy mark takes the place of
    bool m_dragEnabled = false; ///< see setDragEnabled()
    QString m_dragMimeType; ///< see setDragMimeType()
    QMap<QString, QByteArray> m_dragMimeData; ///< see setDragMimeData()
    QPoint m_dragStart; // own coordinates
    bool m_protected = true; // of the last isProtected()
    bool m_adminOnly = false; ///< see setAdminOnly()
    int m_spacing = 5; ///< between the elements, in pixels
    QString m_securityCheck; ///< see setSecurityCheck()
    QString m_resetText; // of the context menu
    QPointer<QTimer> m_doubleClickTimer; ///< see startDoubleClickTimer()

private:
    ElidedButton* createElement(const QString& objectName, const QString& text, bool fillsBackground);
    void startDrag();

    bool m_afterDoubleClick = false; // the next release ends a double click

    static std::shared_ptr<vx::ISecurityManager> s_securityManager;
};

} // namespace PopoverWidget
} // namespace vx
