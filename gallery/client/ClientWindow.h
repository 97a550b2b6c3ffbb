// SPDX-License-Identifier: MIT
// The whole client.
#pragma once

#include <QtWidgets/QWidget>

namespace client
{
/// A client that shows and manages video from network cameras, made of the public classes of the library: first the
/// log-in, then devices, pictures, time line and tools. It follows a change of the language by itself.
class ClientWindow : public QWidget
{
    Q_OBJECT

public:
    explicit ClientWindow(QWidget* parent = nullptr);

Q_SIGNALS:
    /// The user asks for "light" or "dark". Whoever owns the application object applies it.
    void themeWanted(const QString& name);
    /// The user asks for "en", "de" or "fr". Whoever owns the translators installs them.
    void languageWanted(const QString& language);
};
}
