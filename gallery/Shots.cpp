// SPDX-License-Identifier: MIT
// Walks through pages and themes and saves what they look like.
#include "Shots.h"

#include <QtCore/QDir>
#include <QtCore/QTextStream>
#include <QtCore/QTimer>
#include <QtGui/QPixmap>

#include "GalleryWindow.h"
#include "Hand.h"
#include "Page.h"
#include "PageList.h"
#include "popover/Manager.h"

namespace gallery
{
Shots::Shots(GalleryWindow& window, const QString& directory, const QVector<int>& pageIndexes,
             const QVector<zelkov::theme::Name>& themes)
    : QObject(&window), m_window(window), m_directory(directory)
{
    for (const zelkov::theme::Name theme : themes) {
        for (const int page : pageIndexes) {
            m_shots.append({page, theme});
        }
    }
}

void Shots::start()
{
    m_ok = QDir().mkpath(m_directory);
    m_window.show();
    QTimer::singleShot(0, this, &Shots::next);
}

void Shots::next()
{
    if (m_shots.isEmpty()) {
        Q_EMIT finished(m_ok);
        return;
    }
    const Shot shot = m_shots.takeFirst();
    m_window.setTheme(shot.theme);
    m_window.showPage(shot.page);
    auto* hand = new Hand(&m_window);
    hand->wait(50);
    // The steps are told once the page has its size.
    QTimer::singleShot(50, hand, [this, hand, shot] {
        m_window.currentPage()->rehearse(*hand);
        hand->wait(30);
        hand->play([this, hand, shot] {
            save(shot);
            // What a page left open lies over the window, and would be in the next picture.
            if (auto* const popovers = vx::PopoverWidget::Manager::instance()) {
                popovers->dismissAll(&m_window, false, true);
            }
            hand->deleteLater();
            QTimer::singleShot(0, this, &Shots::next);
        });
    });
}

void Shots::save(const Shot& shot)
{
    const QString file = QStringLiteral("%1/%2-%3.png")
                             .arg(m_directory, QLatin1String(pages().at(shot.page).name),
                                  GalleryWindow::themeName(shot.theme));
    const bool saved = m_window.grab().save(file);
    m_ok = m_ok && saved;
    QTextStream(stdout) << file << (saved ? "" : ": cannot be written") << '\n';
}
}
