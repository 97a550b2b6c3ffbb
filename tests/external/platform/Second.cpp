// SPDX-License-Identifier: MIT
// Second platform set: what is not inline.
#include "Core/Log.h"
#include "Core/tconvert.h"
#include "CoreQt/Connect.h"
#include "ZelkovUtils/ReloadStyleSheet.h"

#include <QtWidgets/QStyle>
#include <QtWidgets/QWidget>

#include <iostream>

namespace vx
{
namespace
{
int s_connections = 0;
}

Log& Log::instance()
{
    static Log log;
    return log;
}

std::wostream* Log::getStream(ELevel)
{
    return &std::wcout;
}

Log::ELevel Log::logLevel()
{
    return elSerious;
}

void Log::pre(ELevel, std::wstring& line)
{
    line += L"second set> ";
}

std::wstring tconvert(const char* text)
{
    return QString::fromUtf8(text).toStdWString();
}

bool connect(const QObject* sender, const char* signal, const QObject* receiver, const char* member,
    Qt::ConnectionType type)
{
    ++s_connections;
    return static_cast<bool>(QObject::connect(sender, signal, receiver, member, type));
}

bool disconnect(const QObject* sender, const char* signal, const QObject* receiver, const char* member)
{
    return QObject::disconnect(sender, signal, receiver, member);
}

int connectionCount()
{
    return s_connections;
}

void reloadStyleSheet(QWidget* widget, const QString& objectName)
{
    widget->setObjectName(objectName);
    widget->style()->unpolish(widget);
    widget->style()->polish(widget);
}
}
