// SPDX-License-Identifier: MIT
// The main window: pages on the left, the chosen page on the right, the signals below, switches above.
#pragma once

#include <QtCore/QMap>
#include <QtCore/QPointer>
#include <QtCore/QTranslator>
#include <QtWidgets/QMainWindow>

#include "theme/Theme.h"

class QComboBox;
class QLabel;
class QListWidget;
class QScrollArea;
class QSplitter;
class QTableView;
class QVBoxLayout;

namespace gallery
{
class Page;
class SignalLog;

class GalleryWindow : public QMainWindow
{
    Q_OBJECT

public:
    explicit GalleryWindow(SignalLog& log, QWidget* parent = nullptr);
    ~GalleryWindow() override;

    /// "en", "de" or "fr".
    void setLanguage(const QString& language);
    void setTheme(zelkov::theme::Name theme);
    /// Place in pages().
    void showPage(int index);

    Page* currentPage() const;

    static QStringList languages();
    static QString themeName(zelkov::theme::Name theme);
    /// None as well for an unknown name; then *ok is false.
    static zelkov::theme::Name themeFromName(const QString& name, bool* ok);

private:
    // All widgets are made anew for another language or theme, so nothing needs to re-translate itself. Pages that
    // keep themselves are carried over.
    void rebuild();
    void putPage(Page* page);
    void leavePage();
    void setLogRows(int rows);
    Page* keptPage(int index);
    QWidget* makeTopBar();
    QWidget* makePageList();
    QWidget* makeLog();
    void restartWithScale(const QString& factor);

    SignalLog& m_log;
    QString m_language = QStringLiteral("en");
    zelkov::theme::Name m_theme = zelkov::theme::Name::Light;
    int m_index = 0;
    QList<QTranslator*> m_translators;

    QListWidget* m_list = nullptr;
    QLabel* m_title = nullptr;
    QLabel* m_description = nullptr;
    QVBoxLayout* m_pageLayout = nullptr;
    QScrollArea* m_scroll = nullptr;
    QTableView* m_logTable = nullptr;
    QSplitter* m_upright = nullptr;
    QPointer<Page> m_page;
    QMap<int, QPointer<Page>> m_kept;
};
}
