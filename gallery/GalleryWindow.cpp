// SPDX-License-Identifier: MIT
// The frame around the pages.
#include "GalleryWindow.h"

#include <QtCore/QCoreApplication>
#include <QtCore/QLibraryInfo>
#include <QtCore/QLocale>
#include <QtCore/QProcess>
#include <QtCore/QSortFilterProxyModel>
#include <QtGui/QScreen>
#include <QtWidgets/QApplication>
#include <QtWidgets/QCheckBox>
#include <QtWidgets/QComboBox>
#include <QtWidgets/QHBoxLayout>
#include <QtWidgets/QHeaderView>
#include <QtWidgets/QLabel>
#include <QtWidgets/QLineEdit>
#include <QtWidgets/QListWidget>
#include <QtWidgets/QPushButton>
#include <QtWidgets/QScrollArea>
#include <QtWidgets/QScrollBar>
#include <QtWidgets/QSplitter>
#include <QtWidgets/QTableView>

#include "Page.h"
#include "PageList.h"
#include "SignalLog.h"
#include "client/ClientWindow.h"

namespace gallery
{
namespace
{
const zelkov::theme::Name s_themes[] = {zelkov::theme::Name::Light, zelkov::theme::Name::Dark,
                                        zelkov::theme::Name::None};
const char* const s_scales[] = {"1", "1.25", "1.5", "2"};
const int s_pageRole = Qt::UserRole;
const QSize s_size(1240, 900);
const int s_margin = 20;
const int s_logRowHeight = 22;

QLabel* roleLabel(const char* role)
{
    auto* label = new QLabel;
    label->setProperty("role", QLatin1String(role));
    return label;
}
}

GalleryWindow::GalleryWindow(SignalLog& log, QWidget* parent)
    : QMainWindow(parent), m_log(log)
{
    const QScreen* first = QGuiApplication::primaryScreen();
    const QSize room = first ? first->availableSize() : s_size;
    const bool isOffscreen = QGuiApplication::platformName() == QLatin1String("offscreen");
    resize(s_size.boundedTo(isOffscreen ? s_size : room * 95 / 100));
    client::ClientWindow::initCatalogues();
}

GalleryWindow::~GalleryWindow() = default;

QStringList GalleryWindow::languages()
{
    return {QStringLiteral("en"), QStringLiteral("de"), QStringLiteral("fr")};
}

QString GalleryWindow::themeName(zelkov::theme::Name theme)
{
    switch (theme) {
    case zelkov::theme::Name::Light:
        return QStringLiteral("light");
    case zelkov::theme::Name::Dark:
        return QStringLiteral("dark");
    case zelkov::theme::Name::None:
        break;
    }
    return QStringLiteral("none");
}

zelkov::theme::Name GalleryWindow::themeFromName(const QString& name, bool* ok)
{
    for (const zelkov::theme::Name theme : s_themes) {
        if (themeName(theme) == name) {
            *ok = true;
            return theme;
        }
    }
    *ok = false;
    return zelkov::theme::Name::None;
}

void GalleryWindow::setLanguage(const QString& language)
{
    m_language = language;
    for (QTranslator* translator : qAsConst(m_translators)) {
        QCoreApplication::removeTranslator(translator);
        delete translator;
    }
    m_translators.clear();
    QLocale::setDefault(QLocale(language));
    const QString files[] = {
        QLibraryInfo::location(QLibraryInfo::TranslationsPath) + QStringLiteral("/qtbase_") + language,
        QStringLiteral(":/Translations/ZelkovWidgets_") + language,
        QStringLiteral(":/gallery/gallery_") + language,
        QStringLiteral(":/client/client_") + language,
    };
    for (const QString& file : files) {
        auto* translator = new QTranslator(this);
        if (translator->load(file)) {
            QCoreApplication::installTranslator(translator);
            m_translators.append(translator);
        } else {
            delete translator;
        }
    }
    rebuild();
}

void GalleryWindow::setTheme(zelkov::theme::Name theme)
{
    m_theme = theme;
    zelkov::theme::apply(*qApp, theme);
    rebuild();
}

Page* GalleryWindow::currentPage() const
{
    return m_page;
}

void GalleryWindow::rebuild()
{
    setWindowTitle(tr("Zelkov Gallery"));

    auto* pagePanel = new QWidget;
    m_title = roleLabel("title");
    m_description = roleLabel("hint");
    m_description->setWordWrap(true);
    m_pageLayout = new QVBoxLayout(pagePanel);
    m_pageLayout->setContentsMargins(s_margin, 16, s_margin, 12);
    m_pageLayout->setSpacing(4);
    m_pageLayout->addWidget(m_title);
    m_pageLayout->addWidget(m_description);
    m_pageLayout->addSpacing(8);
    m_scroll = new QScrollArea;
    m_scroll->setProperty("role", QStringLiteral("plain"));
    m_scroll->setFrameShape(QFrame::NoFrame);
    m_scroll->setWidgetResizable(true);
    m_pageLayout->addWidget(m_scroll, 1);

    m_upright = new QSplitter(Qt::Vertical);
    m_upright->addWidget(pagePanel);
    m_upright->addWidget(makeLog());
    m_upright->setStretchFactor(0, 1);
    m_upright->setStretchFactor(1, 0);
    m_upright->setChildrenCollapsible(false);

    auto* body = new QWidget;
    auto* bodyLayout = new QHBoxLayout(body);
    bodyLayout->setContentsMargins(0, 0, 0, 0);
    bodyLayout->setSpacing(0);
    bodyLayout->addWidget(makePageList());
    bodyLayout->addWidget(m_upright, 1);

    auto* all = new QWidget;
    auto* layout = new QVBoxLayout(all);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(makeTopBar());
    layout->addWidget(body, 1);

    const QPointer<QWidget> focus = m_page && m_page->keepsItself() ? m_page->focusWidget() : nullptr;
    if (m_page && m_page->keepsItself()) {
        leavePage();
    }
    // The old widgets may be on the call stack: a combo box of the top bar asks for this.
    if (QWidget* old = takeCentralWidget()) {
        old->hide();
        old->deleteLater();
    }
    m_page = nullptr;
    setCentralWidget(all);
    all->lower(); // popovers and the handles of time lines are children of the window too, and stay above
    showPage(m_index);
    if (focus) {
        focus->setFocus();
    }
}

QWidget* GalleryWindow::makeTopBar()
{
    auto* bar = new QFrame;
    bar->setProperty("role", QStringLiteral("bar"));
    auto* layout = new QHBoxLayout(bar);
    layout->setContentsMargins(s_margin, 8, s_margin, 8);
    layout->setSpacing(8);
    auto* name = roleLabel("heading");
    name->setText(tr("Zelkov Gallery"));
    layout->addWidget(name);
    layout->addStretch(1);

    auto add = [layout](const QString& text, QComboBox* box) {
        auto* label = roleLabel("hint");
        label->setText(text);
        label->setBuddy(box);
        layout->addSpacing(12);
        layout->addWidget(label);
        layout->addWidget(box);
    };

    auto* themes = new QComboBox;
    const QString themeTexts[] = {tr("Light"), tr("Dark"), tr("None")};
    for (int i = 0; i < 3; ++i) {
        themes->addItem(themeTexts[i]);
        if (s_themes[i] == m_theme) {
            themes->setCurrentIndex(i);
        }
    }
    connect(themes, QOverload<int>::of(&QComboBox::activated), this, [this](int i) { setTheme(s_themes[i]); });
    add(tr("Theme"), themes);

    auto* languageBox = new QComboBox;
    languageBox->addItems({QStringLiteral("English"), QStringLiteral("Deutsch"), QStringLiteral("Français")});
    languageBox->setCurrentIndex(qMax(0, languages().indexOf(m_language)));
    connect(languageBox, QOverload<int>::of(&QComboBox::activated), this,
            [this](int i) { setLanguage(languages().at(i)); });
    add(tr("Language"), languageBox);

    auto* scales = new QComboBox;
    const QString current = QString::fromLatin1(qgetenv("QT_SCALE_FACTOR"));
    for (const char* scale : s_scales) {
        const double factor = QByteArray(scale).toDouble();
        scales->addItem(QStringLiteral("%1 %").arg(factor * 100), QLatin1String(scale));
        if (current == QLatin1String(scale)) {
            scales->setCurrentIndex(scales->count() - 1);
        }
    }
    scales->setToolTip(tr("Another scale starts the gallery anew."));
    connect(scales, QOverload<int>::of(&QComboBox::activated), this,
            [this, scales](int i) { restartWithScale(scales->itemData(i).toString()); });
    add(tr("Scale"), scales);
    return bar;
}

QWidget* GalleryWindow::makePageList()
{
    m_list = new QListWidget;
    m_list->setProperty("role", QStringLiteral("sidebar"));
    m_list->setFrameShape(QFrame::NoFrame);
    m_list->setFixedWidth(236);
    m_list->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    QString family;
    for (int i = 0; i < pages().size(); ++i) {
        const PageEntry& entry = pages().at(i);
        if (family != entry.familyText()) {
            family = entry.familyText();
            auto* heading = new QListWidgetItem(family, m_list);
            heading->setFlags(Qt::NoItemFlags);
            heading->setData(s_pageRole, -1);
            heading->setSizeHint(QSize(0, 36));
        }
        auto* item = new QListWidgetItem(entry.titleText(), m_list);
        item->setData(s_pageRole, i);
        item->setSizeHint(QSize(0, 32));
    }
    connect(m_list, &QListWidget::currentItemChanged, this, [this](QListWidgetItem* item) {
        const int index = item ? item->data(s_pageRole).toInt() : -1;
        if (index >= 0 && index != m_index) {
            showPage(index);
        }
    });
    return m_list;
}

QWidget* GalleryWindow::makeLog()
{
    auto* box = new QWidget;
    auto* heading = roleLabel("heading");
    heading->setText(tr("Signals"));
    auto* filter = new QLineEdit;
    filter->setPlaceholderText(tr("Filter"));
    filter->setClearButtonEnabled(true);
    filter->setFixedWidth(200);
    auto* fold = new QCheckBox(tr("Fold repetitions"));
    fold->setChecked(m_log.foldsRepetitions());
    auto* clear = new QPushButton(tr("Clear"));

    auto* proxy = new QSortFilterProxyModel(box);
    proxy->setSourceModel(&m_log);
    proxy->setFilterKeyColumn(-1);
    proxy->setFilterCaseSensitivity(Qt::CaseInsensitive);

    auto* table = new QTableView;
    table->setModel(proxy);
    table->setShowGrid(false);
    table->setSelectionBehavior(QAbstractItemView::SelectRows);
    table->setWordWrap(false);
    table->verticalHeader()->hide();
    table->verticalHeader()->setDefaultSectionSize(s_logRowHeight);
    table->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    table->horizontalHeader()->setStretchLastSection(true);
    table->horizontalHeader()->setHighlightSections(false);
    const int widths[] = {130, 150, 190};
    for (int i = 0; i < 3; ++i) {
        table->setColumnWidth(i, widths[i]);
    }

    connect(fold, &QCheckBox::toggled, &m_log, &SignalLog::setFoldsRepetitions);
    connect(clear, &QPushButton::clicked, &m_log, &SignalLog::clear);
    connect(filter, &QLineEdit::textChanged, proxy, &QSortFilterProxyModel::setFilterFixedString);
    // Follow the end, unless somebody has scrolled up to read.
    connect(table->verticalScrollBar(), &QScrollBar::rangeChanged, table, [table](int, int maximum) {
        QScrollBar* bar = table->verticalScrollBar();
        const int before = table->property("lastMaximum").toInt();
        if (bar->value() >= before || maximum < before) {
            bar->setValue(maximum);
        }
        table->setProperty("lastMaximum", maximum);
    });

    auto* row = new QHBoxLayout;
    row->setSpacing(12);
    row->addWidget(heading);
    row->addStretch(1);
    row->addWidget(fold);
    row->addWidget(filter);
    row->addWidget(clear);
    auto* layout = new QVBoxLayout(box);
    layout->setContentsMargins(s_margin, 4, s_margin, 16);
    layout->setSpacing(8);
    layout->addLayout(row);
    layout->addWidget(table);
    table->ensurePolished();
    m_logTable = table;
    return box;
}

void GalleryWindow::setLogRows(int rows)
{
    // Whole rows, so that the end of the list does not stand below half a row.
    m_logTable->setMinimumHeight(m_logTable->horizontalHeader()->sizeHint().height() + rows * s_logRowHeight
                                 + 2 * m_logTable->frameWidth());
    m_upright->setSizes({10000, 1});
}

void GalleryWindow::showPage(int index)
{
    if (index < 0 || index >= pages().size()) {
        return;
    }
    m_index = index;
    if (!m_pageLayout) {
        return; // there is no language yet
    }
    leavePage();
    const PageEntry& entry = pages().at(index);
    m_title->setText(entry.titleText());
    m_description->setText(entry.descriptionText());
    putPage(keptPage(index));
    for (int row = 0; row < m_list->count(); ++row) {
        if (m_list->item(row)->data(s_pageRole).toInt() == index) {
            m_list->setCurrentRow(row);
        }
    }
}

Page* GalleryWindow::keptPage(int index)
{
    if (m_kept.value(index)) {
        return m_kept.value(index);
    }
    Page* page = pages().at(index).make(m_log, nullptr);
    if (page->keepsItself()) {
        m_kept.insert(index, page);
    }
    // Queued: the page that asks may be replaced on it.
    connect(page, &Page::languageWanted, this, &GalleryWindow::setLanguage, Qt::QueuedConnection);
    connect(page, &Page::themeWanted, this, [this](const QString& name) {
        bool ok = false;
        const zelkov::theme::Name theme = themeFromName(name, &ok);
        if (ok) {
            setTheme(theme);
        }
    }, Qt::QueuedConnection);
    return page;
}

void GalleryWindow::putPage(Page* page)
{
    m_page = page;
    setLogRows(page->logRows());
    m_scroll->setVisible(!page->keepsItself());
    if (page->keepsItself()) {
        m_pageLayout->addWidget(page, 1);
        page->show();
    } else {
        m_scroll->setWidget(page);
    }
}

void GalleryWindow::leavePage()
{
    if (m_page && m_page->keepsItself()) {
        // Never without a window: what the page has put over the window goes by that.
        m_page->setParent(this);
        m_page->hide();
    } else {
        delete m_page;
    }
    m_page = nullptr;
}

void GalleryWindow::restartWithScale(const QString& factor)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("QT_SCALE_FACTOR"), factor);
    QProcess process;
    process.setProgram(QCoreApplication::applicationFilePath());
    process.setArguments({QStringLiteral("--page"), QLatin1String(pages().at(m_index).name), QStringLiteral("--theme"),
                          themeName(m_theme), QStringLiteral("--lang"), m_language});
    process.setProcessEnvironment(environment);
    if (process.startDetached()) {
        close();
    }
}
}
