// SPDX-License-Identifier: MIT
// What the robustness suites do to one class. Each function answers with an empty text, or with what went wrong.
#pragma once

#include <QtCore/QList>
#include <QtCore/QSize>
#include <QtCore/QString>
#include <QtCore/QVariantList>

#include "Registry.h"

namespace zelkovtest
{
/// What a slot may do to the sender of the signal that called it.
enum class Sabotage : int
{
    None,
    DeleteSender,
    DeleteWindow,
    DeleteLaterInNestedLoop,
    Hide,
    Disable,
    NestedLoop,
    Reparent,
};

QList<QPair<QByteArray, Sabotage>> allSabotages();
bool deletes(Sabotage sabotage);

/// Uses an instance by the first script that promises @p signal and does @p sabotage when it fires first. That the
/// signal does not fire at all is a fault.
QString runHostile(const Entry& entry, const QByteArray& signal, Sabotage sabotage);

/// Signals that the class declares and no script promises.
QList<QByteArray> unpromisedSignals(const Entry& entry);

/// @p events random events on instances that are replaced every 500.
QString runMonkey(const Entry& entry, quint32 seed, int events);

/// Values at and beyond the edge of what a type holds; the first is an ordinary one.
QVariantList extremeValues(int type);

/// Writes every extreme value into one property, painting after each.
QString runExtremeProperty(const Entry& entry, const QByteArray& property);
/// Calls one setter with every extreme value in each argument, painting after each.
QString runExtremeSetter(const Entry& entry, const Setter& setter);
/// Writable properties that the library's own classes declare.
QList<QByteArray> writableProperties(const Entry& entry);
/// Gives the widget extreme sizes, fonts, palettes, directions and style sheets, painting after each.
QString runExtremeSurroundings(const Entry& entry);

/// Creates, shows, paints and destroys @p cycles times; no widget may be left.
QString runLeakCycles(const Entry& entry, int cycles);

/// Paints without a screen, even when hidden.
void paint(QWidget* widget);
}
