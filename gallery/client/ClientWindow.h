// SPDX-License-Identifier: MIT
// The whole client.
//
// Object names, for tests and scripts:
//   log-in          loginPanel, loginCard, userEdit, passwordEdit, loginMessage, logInButton, newPasswordButton
//   new password    passwordPanel, passwordForm (firstInput, secondInput), passwordRule0 to passwordRule5,
//                   savePasswordButton, cancelPasswordButton
//   desk            desk, deskSplitter, deskMiddle, wallArea, statusText, siteText, frameRate, devicePanel, ptzPanel
//   tool bar        deskBar, toolBar, viewsButton, thumbnailsButton, liveButton, markButton, lineButton, exportButton,
//                   ptzButton, dropButton, settingsButton, userButton
//   its editing     barEditor, toolList, resetToolsButton, toolsDoneButton
//   popovers        viewsPopover: viewCountRow_4 to viewCountRow_64
//                   userPopover: roleUserRow, roleAdministratorRow, userNewPasswordRow, userLogOutRow
//                   settingsPopover: cameraSearchRow, viewsRow, deviceSideRow, stripesRow, labelsRow (allLabelsRow,
//                   namesRow, timesRow, badgesRow), recordingsRow (pictureRow, recordingsNote, momentRow,
//                   backToLiveRow), camerasRow (renameRow, siteRow, outageRow), accountRow (whoRow, shownNameRow,
//                   idleSwitchRow, idleRow, newPasswordRow), languageRow (languageRow_en, languageRow_de, languageRow_fr),
//                   themeRow (themeRow_light, themeRow_dark), customizeRow, logOutRow
// Rows in brackets stand in a popover of their own, which opens by the row in front of them. Rows are
// children of the window that the client stands in, and a closed popover may still be there for a moment: take the row
// that is visible. The panels name their own parts.
#pragma once

#include <QtWidgets/QWidget>

namespace vx
{
class NavigationViewController;
}

namespace client
{
class Desk;
class Fleet;
class LoginPanel;
class PasswordPanel;
class Session;

/// A client that shows and manages video from network cameras, made of the public classes of the library: first the
/// log-in, then devices, pictures, time line and tools. It follows a change of the language by itself.
class ClientWindow : public QWidget
{
    Q_OBJECT

public:
    explicit ClientWindow(QWidget* parent = nullptr);
    ~ClientWindow() override;

    Fleet& fleet() { return *m_fleet; }
    Session& session() { return *m_session; }
    Desk& desk() { return *m_desk; }

    /// Back to the log-in, with empty fields.
    void logOut();

    /// Makes the catalogues known, ":/client/client_de.qm" and so on. Before they are loaded.
    static void initCatalogues();

Q_SIGNALS:
    /// The user asks for "light" or "dark". Whoever owns the application object applies it.
    void themeWanted(const QString& name);
    /// The user asks for "en", "de" or "fr". Whoever owns the translators installs them.
    void languageWanted(const QString& language);

protected:
    void showEvent(QShowEvent* event) override;

private:
    void slideTo(QWidget* page);

    Fleet* m_fleet;
    Session* m_session;
    vx::NavigationViewController* m_pages;
    LoginPanel* m_login;
    PasswordPanel* m_password;
    Desk* m_desk;
};
}
