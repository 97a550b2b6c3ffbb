// SPDX-License-Identifier: MIT
// The content of a popover: a box of rows.
#pragma once

#include "foundation/Export.h"
#include "popover/PopoverFlags.h"

#include <QtCore/QList>
#include <QtCore/QPointer>
#include <QtCore/QString>
#include <QtCore/QStringList>
#include <QtCore/QVariant>
#include <QtWidgets/QSizePolicy>
#include <QtWidgets/QWidget>

class QBoxLayout;

namespace vx
{
namespace PopoverWidget
{
class Item;

/// A box of items, in a column or a row, with an optional header and footer and with nested containers. It finds
/// items by id, user data or value in all its parts, hands their itemPerformed() on, dismisses the popover for
/// those that want it, and tells the balloon when the layout changed.
///
/// Fill it and give it to Controller::setContainer(), which puts it into a scroll area that owns it from then on.
/// Header and footer are not laid out by the container: the balloon places those that exist at that moment. Until
/// then they have no parent, and the container deletes them with itself. Items are owned through the layout.
///
/// Ids need not be unique. Searches walk the direct items, after each submenu its container, then the header, the
/// footer and the nested containers, each in the same way. An unknown id makes a setter do nothing, without a
/// signal, and a getter give an empty value.
///
/// Where the last argument of an operation is called @p emitSignal, true means: emit layoutChanged() if the
/// container is visible. The adding operations do so by themselves. layoutChanged() of an item comes one turn of
/// the event loop later.
class ZELKOV_WIDGETS_EXPORT Container : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(int spacing READ spacing WRITE setSpacing)
    Q_PROPERTY(int leftMargin READ leftMargin WRITE setLeftMargin)
    Q_PROPERTY(int topMargin READ topMargin WRITE setTopMargin)
    Q_PROPERTY(int rightMargin READ rightMargin WRITE setRightMargin)
    Q_PROPERTY(int bottomMargin READ bottomMargin WRITE setBottomMargin)
    Q_PROPERTY(int layoutOrientation READ layoutOrientation)

public:
    /// An empty box of items in a row or a column; \a alignment is that of its layout.
    Container(QWidget* parent, const QString& objectName, Qt::Orientation orientation,
        QFlags<Qt::AlignmentFlag> alignment);
    ~Container() override;

    /// Pixels between the items; 0 at first. So are the margins below, which start as the style's.
    virtual void setSpacing(int spacing);
    virtual int spacing() const;
    // Room at the end of the layout; as QBoxLayout has it.
    virtual void addStretch(int stretch);
    virtual void addSpacing(int size);
    virtual void addSpacer(QSizePolicy::Policy policy, int width, int height);

    /// Adds an item at the end; what it does when performed is said by @p flags, or by its own defaultItemFlags().
    /// Returns the item. A null item is ignored.
    virtual Item* addItem(Item* item, QFlags<EContainerFlag> flags);
    /// The same with the flags of Item::defaultItemFlags().
    virtual Item* addItem(Item* item);
    /// @p index counts everything in the layout, spacers included; -1 appends. In the list of items, and so in
    /// searches, an inserted item comes last.
    virtual Item* insertItem(Item* item, QFlags<EContainerFlag> flags, int index);
    /// The same with the flags of Item::defaultItemFlags().
    virtual Item* insertItem(Item* item, int index);
    /// Adds a WidgetItem that holds @p widget. It is found like other items, but its signals go nowhere.
    virtual void addWidgetItem(QWidget* widget, const QString& objectName, int id);
    /// The same at a place of the layout.
    virtual void insertWidgetItem(QWidget* widget, int index, const QString& objectName, int id);

    /// Takes all items out, and deletes them at once if @p deleteItems; otherwise they live on as children of the
    /// container, and it is up to the client to delete them. Spacers and nested containers stay. With
    /// @p withHeaderAndFooter the same is done to header and footer, which are then deleted themselves.
    virtual void resetLayout(bool deleteItems, bool withHeaderAndFooter);

    /// Asked before the popover is closed, unless that is forced.
    virtual bool canBeClosed();
    /// Called when the popover begins to close. Emits popoverAboutToClose().
    virtual void popoverClosing();
    /// Called when the popover begins to open. Emits popoverAboutToOpen().
    virtual void popoverOpening();
    /// For subclasses; the library does not call it.
    virtual void popoverClosed();
    /// Called when the popover is open. Sets the tab order.
    virtual void popoverOpened();

    /// Makes a performed item dismiss the popover, as the flags say; part of adding an item. Comes before
    /// applyDefaultConnects(), so a popover is dismissed before its client hears of the item.
    virtual void applyFlags(Item* item, QFlags<EContainerFlag> flags);
    /// Hands itemPerformed() of the item on, unless it has eifNoForward, and its layoutChanged(), queued.
    virtual void applyDefaultConnects(Item* item);

    // Pixels around the items; those of the style at first.
    int leftMargin() const;
    void setLeftMargin(int margin);
    int topMargin() const;
    void setTopMargin(int margin);
    int rightMargin() const;
    void setRightMargin(int margin);
    int bottomMargin() const;
    void setBottomMargin(int margin);
    /// Qt::Vertical or Qt::Horizontal, as a number for style sheets.
    int layoutOrientation() const;

    /// Adds a nested container at the end of the layout and hands its itemPerformed() on.
    void addContainer(Container* container);
    /// Ignored if there is one already.
    void addHeader(Container* header);
    /// Ignored if there is one already.
    void addFooter(Container* footer);
    // Null without one.
    Container* header() const;
    Container* footer() const;
    /// Deletes all items, header and footer.
    void clear();
    /// Takes the first item with that id out; it is deleted later. Emits nothing.
    void removeItem(int id);

    /// All items: own ones and after a submenu those in it, then those of header, footer and nested containers.
    QList<Item*> getItems() const;
    /// Those of them with that id; does not enter submenus with eifNoForward.
    QList<Item*> getItems(int id) const;
    /// Those of getItems() with these user data.
    QList<Item*> getItemsByUserData(const QVariant& userData) const;
    /// Does not look into nested containers, and takes at most one item from a submenu. Odd on purpose.
    QList<Item*> getItemsByValue(const QVariant& value) const;
    /// The first that the list of the same name would hold, or null.
    Item* getItem(int id) const;
    // The first that the list of the same name would hold, or null.
    Item* getItemByUserData(const QVariant& userData) const;
    Item* getItemByValue(const QVariant& value) const;
    /// The first item with that id whose value is true.
    Item* getSelectedItem(int id) const;
    /// Of the whole tree, with duplicates.
    QList<int> getItemIDs() const;
    /// Whether getItem() finds one.
    bool itemExists(int id) const;
    /// Whether it is a direct item.
    bool hasItem(Item* item) const;
    /// Index in the layout, -1 for what is not in it.
    int itemIndex(int id) const;
    /// Index in the layout, -1 for what is not in it.
    int itemIndex(QWidget* widget) const;

    // On the first item with that id.
    QString getItemText(int id) const;
    QString getItemCurrentText(int id) const;
    QVariant getItemValue(int id) const;
    QVariant getItemUserData(int id) const;
    bool getItemVisibility(int id) const;
    void setItemText(int id, const QString& text, bool emitSignal);
    void setItemCurrentText(int id, const QString& text, bool emitSignal);
    void setItemUserData(int id, const QVariant& userData);
    /// A slider item takes lists only. A widget item takes a QWidget*, which then replaces everything in this
    /// container. What does not fit is ignored, without a signal.
    void setItemValue(int id, const QVariant& value, bool emitSignal);
    /// On all direct items with that id, and on no others.
    void setItemBusy(int id, bool busy, bool hideLast, bool emitSignal);
    /// On the first item with that id.
    void setItemVisibility(int id, bool visible, bool emitSignal);
    /// Each id in turn, with a signal for each.
    void setItemVisibility(const QList<int>& ids, bool visible, bool emitSignal);
    // On the first item with that id; both are the same.
    void setItemEnabled(int id, bool enabled, bool emitSignal);
    void enableItem(int id, bool enabled, bool emitSignal);
    // On all items with that id.
    void setItemsChecked(int id, bool checked, bool emitSignal);
    void setItemsEnabled(int id, bool enabled, bool emitSignal);
    void setItemsVisibility(int id, bool visible, bool emitSignal);
    /// Only for containers nested in this one.
    void setContainerVisibility(Container* container, bool visible, bool emitSignal);
    bool getContainerVisibility(Container* container) const;

    /// Fills the container of a submenu with one radio row for each text, all with the id \a itemId and one group, and
    /// chooses the one at \a selected. Whatever else was in there is deleted. Ignored for items that are no submenu.
    void setSubmenuRadioList(
        int submenuId, int itemId, const QStringList& texts, int selected, const QString& objectName);

    /// The item that gets the focus when the popover opens; -1, the default, for none.
    void setAutoFocusItem(int id);
    /// Gives that item's getFocusItem() the focus.
    void setAutoFocus();

    /// Called by the balloon after each layout pass: brings the handles of slider items to their places.
    void updateItems();
    /// Puts the handles of slider items over @p over in the stacking order; null means on top.
    void stackNubsiesOver(QWidget* over);
    /// raise(), then stackNubsiesOver(@p over).
    void raiseContainer(QWidget* over);

Q_SIGNALS:
    /// The content may want another size. Of operations on the container only while it is visible; of a row one
    /// turn of the event loop later, visible or not.
    void layoutChanged();
    /// A row that was added with ecfDismiss is being performed; comes before its itemPerformed().
    void dismissPopover();
    /// The same for ecfDismissAll; comes after dismissPopover().
    void dismissAllPopover();
    /// A row of this container or of one in it was performed; not for rows with eifNoForward.
    void itemPerformed(
        int itemId, const QVariant& value, const QVariant& userData, vx::PopoverWidget::EItemPerformedFlags flag);
    // From popoverClosing() and popoverOpening().
    void popoverAboutToClose();
    void popoverAboutToOpen();

public Q_SLOTS:
    /// Tells the direct items that the content was scrolled.
    void onScrolled();

protected:
    /// Chains the visible focus items in the order of getItems().
    void updateTabOrder();

    void paintEvent(QPaintEvent* event) override;

    /// The direct items without those that have died.
    QList<Item*> items() const;
    /// layoutChanged(), if visible.
    void emitLayoutChanged();
    /// Puts an item into the list of items.
    void append(Item* item);

    QBoxLayout* m_layout; ///< holds the items
    QPointer<Container> m_header; ///< placed by the balloon
    QPointer<Container> m_footer; ///< placed by the balloon
    QList<QPointer<Item>> m_items; ///< in the order in which they were added
    QList<QPointer<Container>> m_containers; ///< nested ones
    int m_orientation; ///< Qt::Vertical or Qt::Horizontal
    int m_autoFocusItem = -1; ///< see setAutoFocusItem()

private:
    template <class Visitor> bool walk(bool intoNoForward, const Visitor& visitor) const;
    template <class Change> void changeItem(Item* item, bool emitSignal, const Change& change);
    template <class Change> void changeItems(int id, bool emitSignal, const Change& change);
    bool dropPart(QPointer<Container>& part, bool deleteItems);
    void dropItems(bool deleteItems);
};

} // namespace PopoverWidget
} // namespace vx
