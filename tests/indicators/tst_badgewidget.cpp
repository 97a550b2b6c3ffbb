// SPDX-License-Identifier: MIT
// The badge as a widget: properties, style sheets and painting.
#include "indicators/BadgeWidget.h"
#include "TestCase.h"
#include "TestMain.h"

#include <QtCore/QMetaProperty>
#include <QtGui/QPainter>
#include <QtGui/QPixmapCache>
#include <QtTest/QtTest>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QProxyStyle>
#include <QtWidgets/QStyleOption>

#include <memory>

using vx::BadgeDrawer;
using vx::BadgeWidget;

namespace
{
// The widget's own pixels over nothing.
QImage rendered(QWidget& widget)
{
    QImage image(widget.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    widget.render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
    return image;
}

QRect inked(const QImage& image)
{
    QRect bounds;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (qAlpha(image.pixel(x, y)) != 0) {
                bounds |= QRect(x, y, 1, 1);
            }
        }
    }
    return bounds;
}
}

class TestBadgeWidget : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void startsLikeItsDrawer();
    void propertiesHaveTheirTypes_data();
    void propertiesHaveTheirTypes();
    void propertiesForwardToTheDrawer_data();
    void propertiesForwardToTheDrawer();
    void styleSheetSetsTheProperties();
    void unknownBusyTypesAreSafe();
    void labelIsNotCrossed();
    void labelUsesTheStrokeProperty();
    void busyForwardsToTheDrawer();
    void drawerIsAChildWithTheWidgetAsHost();
    void sizeHintFollowsTheBadge();
    void layoutFollowsTheBadge();
    void isTransparentBesideTheBadge();
    void paintsTheBadgeAligned_data();
    void paintsTheBadgeAligned();
    void rightIsRightInEveryLayoutDirection();
    void alignmentShowsAtOnce();
    void paintsTheStyleSheetBackground();
    void letsTheStylePaintTheWidget();
    void paintsWithoutABadge();
    void hiddenSpinnerSleeps();
    void widgetMayDieInItsDrawersSignal();
    void windowMayDieInTheDrawersSignal();
    void reparentingKeepsSpinning();
};

void TestBadgeWidget::init()
{
    TestCase::init();
    QPixmapCache::clear();
}

void TestBadgeWidget::startsLikeItsDrawer()
{
    BadgeWidget widget(nullptr);
    QCOMPARE(widget.alignment(), Qt::AlignRight | Qt::AlignTop);
    QCOMPARE(widget.busyBadgeType(), 3);
    QCOMPARE(widget.badgeSize(), QSize(20, 20));
    QCOMPARE(widget.badgeStroke(), false);
    QCOMPARE(widget.badgeColor(), QColor(255, 255, 255, 255));
    QCOMPARE(widget.busyColor1(), QColor(255, 255, 255, 255));
    QCOMPARE(widget.busyColor2(), QColor(192, 192, 192, 255));
    QCOMPARE(widget.badgeBackground(), QColor(246, 67, 70, 220));
    QCOMPARE(widget.badgeLabel(), QString());
    QVERIFY(!widget.hasBadge());
    QCOMPARE(widget.sizeHint(), QSize(20, 20));
}

void TestBadgeWidget::propertiesHaveTheirTypes_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::addColumn<QByteArray>("type");
    QTest::newRow("alignment") << QByteArray("alignment") << QByteArray("Qt::Alignment");
    QTest::newRow("busyBadgeType") << QByteArray("busyBadgeType") << QByteArray("int");
    QTest::newRow("badgeSize") << QByteArray("badgeSize") << QByteArray("QSize");
    QTest::newRow("badgeStroke") << QByteArray("badgeStroke") << QByteArray("bool");
    QTest::newRow("badgeColor") << QByteArray("badgeColor") << QByteArray("QColor");
    QTest::newRow("busyColor1") << QByteArray("busyColor1") << QByteArray("QColor");
    QTest::newRow("busyColor2") << QByteArray("busyColor2") << QByteArray("QColor");
    QTest::newRow("badgeBackground") << QByteArray("badgeBackground") << QByteArray("QColor");
}

void TestBadgeWidget::propertiesHaveTheirTypes()
{
    QFETCH(QByteArray, name);
    const QMetaObject& meta = BadgeWidget::staticMetaObject;
    const int index = meta.indexOfProperty(name.constData());
    QVERIFY(index >= meta.propertyOffset());
    QCOMPARE(meta.propertyCount() - meta.propertyOffset(), 8);
    const QMetaProperty property = meta.property(index);
    QTEST(QByteArray(property.typeName()), "type");
    QVERIFY(property.isReadable());
    QVERIFY(property.isWritable());
}

void TestBadgeWidget::propertiesForwardToTheDrawer_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::addColumn<QVariant>("value");
    QTest::newRow("alignment") << QByteArray("alignment")
                               << QVariant::fromValue(Qt::Alignment(Qt::AlignLeft | Qt::AlignBottom));
    QTest::newRow("busyBadgeType") << QByteArray("busyBadgeType") << QVariant(1);
    QTest::newRow("badgeSize") << QByteArray("badgeSize") << QVariant(QSize(44, 33));
    QTest::newRow("badgeStroke") << QByteArray("badgeStroke") << QVariant(true);
    QTest::newRow("badgeColor") << QByteArray("badgeColor") << QVariant(QColor(1, 2, 3));
    QTest::newRow("busyColor1") << QByteArray("busyColor1") << QVariant(QColor(4, 5, 6));
    QTest::newRow("busyColor2") << QByteArray("busyColor2") << QVariant(QColor(7, 8, 9));
    QTest::newRow("badgeBackground") << QByteArray("badgeBackground") << QVariant(QColor(10, 11, 12));
}

void TestBadgeWidget::propertiesForwardToTheDrawer()
{
    QFETCH(QByteArray, name);
    QFETCH(QVariant, value);
    BadgeWidget widget(nullptr);
    const auto state = [&widget] {
        const BadgeDrawer& badge = widget.badge();
        return QVariantMap {{QStringLiteral("alignment"), QVariant::fromValue(widget.alignment())},
            {QStringLiteral("busyBadgeType"), int(badge.busyBadgeType())},
            {QStringLiteral("badgeSize"), badge.badgeSize()}, {QStringLiteral("badgeStroke"), badge.badgeStroke()},
            {QStringLiteral("badgeColor"), badge.badgeColor()}, {QStringLiteral("busyColor1"), badge.busyColor1()},
            {QStringLiteral("busyColor2"), badge.busyColor2()},
            {QStringLiteral("badgeBackground"), badge.badgeBackground()}};
    };
    const QString key = QString::fromLatin1(name);
    QVariantMap before = state();
    QVERIFY(widget.setProperty(name.constData(), value));
    QCOMPARE(widget.property(name.constData()), value);
    QVariantMap after = state();
    if (key == QLatin1String("alignment")) {
        QCOMPARE(widget.alignment(), Qt::AlignLeft | Qt::AlignBottom);
    } else {
        QCOMPARE(after.value(key), value);
        QVERIFY(before.value(key) != value);
    }
    before.remove(key);
    after.remove(key);
    before.remove(QStringLiteral("alignment"));
    after.remove(QStringLiteral("alignment"));
    QCOMPARE(after, before);
}

void TestBadgeWidget::styleSheetSetsTheProperties()
{
    QWidget window;
    BadgeWidget widget(&window);
    window.setStyleSheet(QStringLiteral("vx--BadgeWidget { qproperty-alignment: 'AlignLeft | AlignBottom';"
                                        " qproperty-busyBadgeType: 2; qproperty-badgeSize: 32px 24px;"
                                        " qproperty-badgeStroke: true; qproperty-badgeColor: rgb(1, 2, 3);"
                                        " qproperty-busyColor1: #102030; qproperty-busyColor2: rgba(4, 5, 6, 255);"
                                        " qproperty-badgeBackground: blue; }"));
    window.ensurePolished();
    widget.ensurePolished();
    QCOMPARE(widget.alignment(), Qt::AlignLeft | Qt::AlignBottom);
    QCOMPARE(widget.busyBadgeType(), 2);
    QCOMPARE(widget.badgeSize(), QSize(32, 24));
    QCOMPARE(widget.badgeStroke(), true);
    QCOMPARE(widget.badgeColor(), QColor(1, 2, 3));
    QCOMPARE(widget.busyColor1(), QColor(0x10, 0x20, 0x30));
    QCOMPARE(widget.busyColor2(), QColor(4, 5, 6));
    QCOMPARE(widget.badgeBackground(), QColor(Qt::blue));
}

void TestBadgeWidget::unknownBusyTypesAreSafe()
{
    BadgeWidget widget(nullptr);
    widget.resize(40, 40);
    for (const int type : {-1, 4, 99, 0x7fffffff, int(0x80000000u)}) {
        QVERIFY(widget.setProperty("busyBadgeType", type));
        QCOMPARE(widget.busyBadgeType(), type);
        widget.setBadgeBusy(true);
        QVERIFY(inked(rendered(widget)).isNull());
        widget.setBadgeBusy(false);
    }
    widget.setBusyBadgeType(0);
    widget.setBadgeBusy(true);
    QVERIFY(!inked(rendered(widget)).isNull());
}

void TestBadgeWidget::labelIsNotCrossed()
{
    BadgeWidget widget(nullptr);
    widget.setBadgeLabel(QStringLiteral("4"));
    QCOMPARE(widget.badgeLabel(), QStringLiteral("4"));
    QVERIFY(widget.hasBadge());
    const QImage shown = widget.badge().currentPixmap().toImage();
    BadgeDrawer drawer(nullptr, nullptr);
    drawer.setBadgeLabel(QStringLiteral("4"), false);
    QCOMPARE(shown, drawer.currentPixmap().toImage());
    drawer.setBadgeLabel(QStringLiteral("4"), true);
    QVERIFY(shown != drawer.currentPixmap().toImage());
}

void TestBadgeWidget::labelUsesTheStrokeProperty()
{
    BadgeWidget widget(nullptr);
    widget.setBadgeLabel(QStringLiteral("4"));
    const QImage plain = widget.badge().currentPixmap().toImage();
    widget.setBadgeStroke(true);
    QCOMPARE(widget.badge().currentPixmap().toImage(), plain);
    widget.setBadgeLabel(QStringLiteral("4"));
    QVERIFY(widget.badge().currentPixmap().toImage() != plain);
}

void TestBadgeWidget::busyForwardsToTheDrawer()
{
    BadgeWidget widget(nullptr);
    widget.setBadgeBusy(true);
    QVERIFY(widget.badge().badgeBusy());
    QVERIFY(widget.hasBadge());
    widget.setBadgeBusy(false);
    QVERIFY(!widget.badge().badgeBusy());
    QVERIFY(!widget.hasBadge());
}

void TestBadgeWidget::drawerIsAChildWithTheWidgetAsHost()
{
    BadgeWidget widget(nullptr);
    QCOMPARE(widget.badge().parent(), &widget);
    widget.resize(50, 40);
    widget.setBadgeLabel(QString());
    QCOMPARE(inked(rendered(widget)), QRect(30, 0, 20, 20));
}

void TestBadgeWidget::sizeHintFollowsTheBadge()
{
    BadgeWidget widget(nullptr);
    widget.setBadgeSize(QSize(30, 30));
    QCOMPARE(widget.sizeHint(), QSize(30, 30));
    widget.setBadgeLabel(QStringLiteral("a longer text"));
    QCOMPARE(widget.sizeHint().height(), 30);
    QVERIFY(widget.sizeHint().width() > 100);
    QCOMPARE(widget.sizeHint(), widget.badge().currentPixmap().size());
}

void TestBadgeWidget::layoutFollowsTheBadge()
{
    QWidget window;
    auto* layout = new QHBoxLayout(&window);
    auto* widget = new BadgeWidget(&window);
    layout->addWidget(widget, 0, Qt::AlignCenter);
    window.resize(300, 100);
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window));
    QCOMPARE(widget->size(), QSize(20, 20));
    widget->setBadgeLabel(QStringLiteral("wider"));
    QTRY_COMPARE(widget->size(), widget->badge().currentPixmap().size());
    QVERIFY(widget->width() > 20);
}

void TestBadgeWidget::isTransparentBesideTheBadge()
{
    QWidget window;
    window.setStyleSheet(QStringLiteral("QWidget#window { background: rgb(0, 0, 200) }"));
    window.setObjectName(QStringLiteral("window"));
    window.resize(100, 100);
    BadgeWidget widget(&window);
    widget.setGeometry(20, 20, 60, 60);
    widget.setBadgeLabel(QString());
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window));
    const QImage image = window.grab().toImage();
    QCOMPARE(image.pixelColor(25, 70), QColor(0, 0, 200));
    QCOMPARE(image.pixelColor(60, 20), QColor(0, 0, 200));
    QVERIFY(image.pixelColor(70, 30).red() > 180);
    QVERIFY(!widget.testAttribute(Qt::WA_OpaquePaintEvent));
    QVERIFY(!widget.autoFillBackground());
}

void TestBadgeWidget::paintsTheBadgeAligned_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<QPoint>("topLeft");
    QTest::newRow("left top") << int(Qt::AlignLeft | Qt::AlignTop) << QPoint(0, 0);
    QTest::newRow("right top") << int(Qt::AlignRight | Qt::AlignTop) << QPoint(60, 0);
    QTest::newRow("right bottom") << int(Qt::AlignRight | Qt::AlignBottom) << QPoint(60, 40);
    QTest::newRow("left bottom") << int(Qt::AlignLeft | Qt::AlignBottom) << QPoint(0, 40);
    QTest::newRow("centre") << int(Qt::AlignCenter) << QPoint(30, 20);
}

void TestBadgeWidget::paintsTheBadgeAligned()
{
    QFETCH(int, alignment);
    QFETCH(QPoint, topLeft);
    BadgeWidget widget(nullptr);
    widget.resize(80, 60);
    widget.setBadgeLabel(QString());
    widget.setAlignment(Qt::Alignment(alignment));
    QCOMPARE(inked(rendered(widget)), QRect(topLeft, QSize(20, 20)));
}

void TestBadgeWidget::rightIsRightInEveryLayoutDirection()
{
    BadgeWidget widget(nullptr);
    widget.resize(80, 60);
    widget.setBadgeLabel(QString());
    widget.setLayoutDirection(Qt::RightToLeft);
    QCOMPARE(inked(rendered(widget)), QRect(60, 0, 20, 20));
}

void TestBadgeWidget::alignmentShowsAtOnce()
{
    QWidget window;
    window.resize(100, 100);
    BadgeWidget widget(&window);
    widget.setGeometry(0, 0, 80, 60);
    widget.setBadgeLabel(QString());
    window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&window));
    QCoreApplication::processEvents();
    struct Watch : QObject
    {
        bool eventFilter(QObject*, QEvent* event) override
        {
            paints += event->type() == QEvent::Paint ? 1 : 0;
            return false;
        }
        int paints = 0;
    } watch;
    widget.installEventFilter(&watch);
    widget.setAlignment(Qt::AlignRight | Qt::AlignTop);
    QCoreApplication::processEvents();
    QCOMPARE(watch.paints, 0);
    widget.setAlignment(Qt::AlignLeft | Qt::AlignTop);
    QTRY_COMPARE(watch.paints, 1);
}

void TestBadgeWidget::paintsTheStyleSheetBackground()
{
    BadgeWidget widget(nullptr);
    widget.resize(60, 40);
    widget.setBadgeLabel(QString());
    widget.setStyleSheet(
        QStringLiteral("vx--BadgeWidget { background: rgb(0, 128, 0); border: 3px solid yellow }"));
    const QImage image = rendered(widget);
    QCOMPARE(image.pixelColor(1, 20), QColor(Qt::yellow));
    QCOMPARE(image.pixelColor(20, 25), QColor(0, 128, 0));
    QVERIFY(image.pixelColor(50, 10).red() > 180);
}

void TestBadgeWidget::letsTheStylePaintTheWidget()
{
    class Style : public QProxyStyle
    {
    public:
        void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
            const QWidget* widget) const override
        {
            if (element == PE_Widget) {
                painter->fillRect(option->rect, Qt::green);
            } else {
                QProxyStyle::drawPrimitive(element, option, painter, widget);
            }
        }
    } style;
    BadgeWidget widget(nullptr);
    widget.resize(60, 40);
    widget.setBadgeLabel(QString());
    QCOMPARE(rendered(widget).pixelColor(10, 10).alpha(), 0);
    widget.setStyle(&style);
    QCOMPARE(rendered(widget).pixelColor(10, 10), QColor(Qt::green));
    QVERIFY(rendered(widget).pixelColor(50, 10).red() > 180);
    widget.setStyle(nullptr);
    QCOMPARE(rendered(widget).pixelColor(10, 10).alpha(), 0);
}

void TestBadgeWidget::paintsWithoutABadge()
{
    BadgeWidget widget(nullptr);
    widget.resize(60, 40);
    QVERIFY(inked(rendered(widget)).isNull());
    widget.resize(0, 0);
    widget.setBadgeBusy(true);
    widget.repaint();
}

void TestBadgeWidget::hiddenSpinnerSleeps()
{
    QWidget window;
    window.resize(100, 100);
    BadgeWidget widget(&window);
    widget.setBadgeBusy(true);
    auto* timer = widget.badge().findChild<QTimer*>();
    QVERIFY(!timer->isActive());
    window.show();
    QVERIFY(timer->isActive());
    QSignalSpy spy(&widget.badge(), &BadgeDrawer::pixmapChanged);
    QVERIFY(spy.wait());
    widget.hide();
    QVERIFY(!timer->isActive());
    widget.show();
    QVERIFY(timer->isActive());
    window.hide();
    QVERIFY(!timer->isActive());
}

void TestBadgeWidget::widgetMayDieInItsDrawersSignal()
{
    QWidget window;
    window.resize(100, 100);
    QPointer<BadgeWidget> widget = new BadgeWidget(&window);
    widget->setBadgeBusy(true);
    connect(&widget->badge(), &BadgeDrawer::pixmapChanged, this, [widget] { delete widget.data(); });
    window.show();
    QTRY_VERIFY(widget.isNull());
}

void TestBadgeWidget::windowMayDieInTheDrawersSignal()
{
    QPointer<QWidget> window = new QWidget;
    window->resize(100, 100);
    auto* widget = new BadgeWidget(window);
    widget->setBadgeBusy(true);
    connect(&widget->badge(), &BadgeDrawer::pixmapChanged, this, [window] { delete window.data(); });
    window->show();
    QTRY_VERIFY(window.isNull());
}

void TestBadgeWidget::reparentingKeepsSpinning()
{
    QWidget first;
    QWidget second;
    first.resize(100, 100);
    second.resize(100, 100);
    BadgeWidget widget(&first);
    widget.setBadgeBusy(true);
    first.show();
    auto* timer = widget.badge().findChild<QTimer*>();
    QVERIFY(timer->isActive());
    widget.setParent(&second);
    QVERIFY(!timer->isActive());
    widget.show();
    QVERIFY(!timer->isActive());
    second.show();
    QVERIFY(timer->isActive());
    widget.setParent(nullptr);
}

ZELKOV_TEST_MAIN(TestBadgeWidget)
#include "tst_badgewidget.moc"
