// SPDX-License-Identifier: MIT
// What docs/styling.md promises to style sheets: every name, property and state is heeded by the real widget, and
// the page, the table of this test and the sources tell of the same ones.
#include "StylingPage.h"
#include "StylingTable.h"

#include "popover/Manager.h"
#include "support/TestCase.h"
#include "support/TestMain.h"
#include "theme/Theme.h"

#include <QtCore/QRegularExpression>
#include <QtCore/QSet>
#include <QtGui/QImage>
#include <QtTest/QtTest>
#include <QtWidgets/QApplication>

#include <algorithm>
#include <memory>

using styling::Line;
using styling::Proof;
using styling::Row;

namespace
{
/// A window with the widget of a row.
class Scene
{
public:
    explicit Scene(const Row& row)
        : m_window(new QWidget)
    {
        m_window->resize(400, 400);
        m_window->show();
        (void)QTest::qWaitForWindowExposed(m_window.get());
        m_widget = row.build(m_window.get());
        settle();
    }
    ~Scene()
    {
        m_window.reset();
        vx::PopoverWidget::Manager::deleteInstance();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
    Scene(const Scene&) = delete;
    Scene& operator=(const Scene&) = delete;

    static void settle()
    {
        QCoreApplication::processEvents();
        QCoreApplication::processEvents();
    }
    void wear(const QString& sheet)
    {
        m_window->setStyleSheet(sheet);
        settle();
    }
    QWidget* window() const { return m_window.get(); }
    QWidget* widget() const { return m_widget; }
    QImage look() const { return m_window->grab().toImage(); }
    int marked() const { return styling::markedPixels(look()); }
    bool dressed() const
    {
        QList<QWidget*> all = m_window->findChildren<QWidget*>();
        return std::any_of(all.begin(), all.end(),
            [](const QWidget* widget) { return widget->toolTip() == QLatin1String("dressed"); });
    }

private:
    std::unique_ptr<QWidget> m_window;
    QPointer<QWidget> m_widget;
};

QStringList sorted(const QStringList& list)
{
    QStringList result = list;
    result.sort();
    return result;
}

QStringList keysOfTable()
{
    QStringList result;
    for (const Row& row : styling::table()) {
        result << row.key;
    }
    return result;
}

QStringList documented()
{
    return styling::keysOfPage(QStringLiteral("Selector")) + styling::keysOfPage(QStringLiteral("Property"))
        + styling::keysOfPage(QStringLiteral("State property"));
}

/// Those of the first list that the second lacks.
QStringList missing(const QStringList& wanted, const QStringList& present)
{
    QStringList result;
    for (const QString& one : wanted) {
        if (!present.contains(one)) {
            result << one;
        }
    }
    result.removeDuplicates();
    return sorted(result);
}

/// The last "#name" of every selector of the page.
QStringList documentedNames()
{
    QStringList result;
    static const QRegularExpression name(QStringLiteral("#([\\w-]+)"));
    for (const QString& key : styling::keysOfPage(QStringLiteral("Selector"))) {
        QRegularExpressionMatchIterator all = name.globalMatch(key);
        while (all.hasNext()) {
            result << all.next().captured(1);
        }
    }
    return result;
}
}

class TestStyling : public zelkovtest::TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanup();
    void theWidgetHeedsTheRule_data();
    void theWidgetHeedsTheRule();
    void thePageAndTheTableTellOfTheSame();
    void noRowIsToldTwice();
    void thePageTellsTheDefaults();
    void thePageTellsWhoPaintsItsBox();
    void theNamesSetInTheSourcesAreTold();
    void theNamesOnShowAreTold();
    void thePropertiesInTheHeadersAreTold();
    void theWidgetClassesAreTold();
    void thePicturesNamedInTheSourcesAreTold();
};

void TestStyling::initTestCase()
{
    // The pictures that the library names but does not carry.
    (void)zelkov::theme::styleSheet(zelkov::theme::Name::None);
}

void TestStyling::cleanup()
{
    qApp->setStyleSheet(QString());
    TestCase::cleanup();
}

void TestStyling::theWidgetHeedsTheRule_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<bool>("live");
    const styling::Table table = styling::table();
    for (int i = 0; i < table.size(); ++i) {
        QTest::addRow("%s, application", qPrintable(table.at(i).key)) << i << false;
        QTest::addRow("%s, window on show", qPrintable(table.at(i).key)) << i << true;
    }
}

void TestStyling::theWidgetHeedsTheRule()
{
    QFETCH(const int, index);
    QFETCH(const bool, live);
    const Row row = styling::table().at(index);

    QImage plainLook;
    QString plainValue;
    {
        const Scene plain(row);
        plainLook = plain.look();
        QCOMPARE(styling::markedPixels(plainLook), 0);
        QVERIFY(!plain.dressed());
        if (!row.property.isEmpty()) {
            QVERIFY(plain.widget() != nullptr);
            plainValue = styling::text(plain.widget(), row.property);
            QVERIFY2(plainValue != row.value, qPrintable(plainValue));
        }
    }

    if (!live) {
        qApp->setStyleSheet(row.rule);
    }
    Scene scene(row);
    if (live) {
        scene.wear(row.rule);
    }
    switch (row.proof) {
    case Proof::Box:
    case Proof::Rule:
        QTRY_VERIFY2(scene.marked() > 4, qPrintable(row.rule));
        break;
    case Proof::WindowRule:
        if (live) {
            QTRY_VERIFY2(scene.marked() > 4, qPrintable(row.rule));
        } else {
            QTest::qWait(100); // for what must not come
            QCOMPARE(scene.marked(), 0);
        }
        break;
    case Proof::NoBox:
        QVERIFY(scene.dressed());
        QCOMPARE(scene.marked(), 0);
        break;
    case Proof::Value:
    case Proof::Picture:
    case Proof::Later:
        QCOMPARE(styling::text(scene.widget(), row.property), row.value);
        if (row.proof == Proof::Picture || (row.proof == Proof::Later && !live)) {
            QTRY_VERIFY(scene.look() != plainLook);
        }
        break;
    case Proof::Look:
        QTRY_VERIFY(scene.look() != plainLook);
        break;
    }
}

void TestStyling::thePageAndTheTableTellOfTheSame()
{
    QVERIFY(documented().size() > 150);
    QCOMPARE(missing(documented(), keysOfTable()).join(QLatin1Char('\n')), QString());
    QCOMPARE(missing(keysOfTable(), documented()).join(QLatin1Char('\n')), QString());
}

void TestStyling::noRowIsToldTwice()
{
    QStringList once = documented();
    once.removeDuplicates();
    QCOMPARE(once.size(), documented().size());
    once = keysOfTable();
    once.removeDuplicates();
    QCOMPARE(once.size(), keysOfTable().size());
}

void TestStyling::thePageTellsTheDefaults()
{
    QHash<QString, QString> told;
    for (const Line& line : styling::linesOfPage(QStringLiteral("Property"))
            + styling::linesOfPage(QStringLiteral("State property"))) {
        told.insert(line.key, QString(line.cells.value(2)).remove(QLatin1Char('`')));
    }
    QStringList wrong;
    for (const Row& row : styling::table()) {
        // "-" is what the program gives in the constructor or the scene had to give.
        if (row.property.isEmpty() || told.value(row.key) == QLatin1String("-")) {
            continue;
        }
        const Scene scene(row);
        const QString found = styling::text(scene.widget(), row.property);
        if (found != told.value(row.key)) {
            wrong << row.key + QLatin1String(" is ") + found + QLatin1String(", told as ") + told.value(row.key);
        }
    }
    QCOMPARE(wrong.join(QLatin1Char('\n')), QString());
}

void TestStyling::thePageTellsWhoPaintsItsBox()
{
    QHash<QString, QString> told;
    for (const Line& line : styling::linesOfPage(QStringLiteral("Selector"))) {
        told.insert(line.key, line.cells.value(2));
    }
    QStringList wrong;
    for (const Row& row : styling::table()) {
        const QString box = told.value(row.key);
        const bool right = row.proof == Proof::Box ? box == QLatin1String("yes")
            : row.proof == Proof::NoBox            ? box == QLatin1String("no")
                                                   : true;
        if (!right) {
            wrong << row.key;
        }
    }
    QCOMPARE(wrong.join(QLatin1Char('\n')), QString());
}

void TestStyling::theNamesSetInTheSourcesAreTold()
{
    QStringList found;
    static const QRegularExpression setter(QStringLiteral(
        "(?:setObjectName|makeTitleButton|createElement|nameSymbol)\\(QStringLiteral\\(\"([^\"]+)\"\\)"));
    const QHash<QString, QString> files = styling::sources(QStringLiteral("cpp"));
    QVERIFY(files.size() > 50);
    for (const QString& source : files) {
        QRegularExpressionMatchIterator all = setter.globalMatch(source);
        while (all.hasNext()) {
            found << all.next().captured(1);
        }
    }
    QVERIFY2(found.size() > 25, qPrintable(QString::number(found.size())));
    QCOMPARE(missing(found, documentedNames()).join(QLatin1Char('\n')), QString());
}

void TestStyling::theNamesOnShowAreTold()
{
    QSet<QString> found;
    for (const Row& row : styling::table()) {
        const Scene scene(row);
        for (const QWidget* const widget : scene.window()->findChildren<QWidget*>()) {
            // Qt names its own parts so.
            if (!widget->objectName().startsWith(QLatin1String("qt_"))) {
                found << widget->objectName();
            }
        }
    }
    found.remove(QString());
    QVERIFY(found.size() > 60);
    QStringList names = found.values();
    // The client's: the last word of a row, of a list, and of a submenu's rows.
    names.removeAll(QStringLiteral("row"));
    QCOMPARE(missing(names, documentedNames()).join(QLatin1Char('\n')), QString());
}

void TestStyling::thePropertiesInTheHeadersAreTold()
{
    QStringList told;
    for (const QString& key : styling::keysOfPage(QStringLiteral("Property"))
            + styling::keysOfPage(QStringLiteral("State property"))) {
        told << QString(key).remove(QStringLiteral("{ qproperty-")).remove(QStringLiteral(" }"));
    }
    told += styling::keysOfPage(QStringLiteral("Beyond a sheet"));
    static const QRegularExpression word(
        QStringLiteral("class (?:ZELKOV_WIDGETS_EXPORT )?(\\w+)[^;{]*\\{|Q_PROPERTY\\([\\w:]+ (\\w+)"));
    QStringList found;
    const QHash<QString, QString> files = styling::sources(QStringLiteral("h"));
    for (const QString& source : files) {
        QString owner;
        QRegularExpressionMatchIterator all = word.globalMatch(source);
        while (all.hasNext()) {
            const QRegularExpressionMatch match = all.next();
            if (!match.captured(1).isEmpty()) {
                owner = match.captured(1);
            } else {
                found << owner + QLatin1Char(' ') + match.captured(2);
            }
        }
    }
    QVERIFY(found.size() > 70);
    for (QString& one : told) {
        one = one.mid(one.lastIndexOf(QLatin1String("--")) + (one.contains(QLatin1String("--")) ? 2 : 1));
    }
    QCOMPARE(missing(found, told).join(QLatin1Char('\n')), QString());
}

void TestStyling::theWidgetClassesAreTold()
{
    static const QRegularExpression head(QStringLiteral(
        "\nclass (?:ZELKOV_WIDGETS_EXPORT )?(\\w+)[^;{]*: ([^;{]*)\\{\\s*Q_OBJECT"));
    static const QRegularExpression notAWidget(
        QStringLiteral("public (QObject|QPropertyAnimation|QAbstract\\w+|QSortFilterProxyModel|QStyledItemDelegate)"));
    QStringList found;
    const QHash<QString, QString> files = styling::sources(QStringLiteral("h"));
    for (const QString& source : files) {
        QRegularExpressionMatchIterator all = head.globalMatch(source);
        while (all.hasNext()) {
            const QRegularExpressionMatch match = all.next();
            if (!match.captured(2).contains(notAWidget)) {
                found << match.captured(1);
            }
        }
    }
    QVERIFY2(found.size() > 50, qPrintable(QString::number(found.size())));
    QStringList told;
    for (const QString& key : styling::keysOfPage(QStringLiteral("Selector"))) {
        told << key.mid(key.lastIndexOf(QLatin1String("--")) + (key.contains(QLatin1String("--")) ? 2 : 1)) << key;
    }
    QCOMPARE(missing(found, told).join(QLatin1Char('\n')), QString());
}

void TestStyling::thePicturesNamedInTheSourcesAreTold()
{
    static const QRegularExpression path(QStringLiteral("\"(:/[^\"]+)\""));
    QStringList found;
    for (const QString& suffix : {QStringLiteral("cpp"), QStringLiteral("h")}) {
        const QHash<QString, QString> files = styling::sources(suffix);
        for (const QString& source : files) {
            QRegularExpressionMatchIterator all = path.globalMatch(source);
            while (all.hasNext()) {
                const QString one = all.next().captured(1);
                if (!one.contains(QLatin1Char('%'))) {
                    found << one;
                    continue;
                }
                for (const char* const color : {"red", "green", "gray"}) {
                    found << one.arg(QLatin1String(color)).arg(1) << one.arg(QLatin1String(color)).arg(2);
                }
            }
        }
    }
    const QStringList told = styling::keysOfPage(QStringLiteral("Picture"));
    QCOMPARE(missing(found, told).join(QLatin1Char('\n')), QString());
    QCOMPARE(missing(told, found).join(QLatin1Char('\n')), QString());
    for (const QString& one : told) {
        QVERIFY2(!QImage(one).isNull(), qPrintable(one));
    }
}

ZELKOV_TEST_MAIN(TestStyling)
#include "tst_styling.moc"
