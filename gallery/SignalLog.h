// SPDX-License-Identifier: MIT
// The list of every signal that the watched objects have sent.
#pragma once

#include <memory>

#include <QtCore/QAbstractTableModel>
#include <QtCore/QFile>
#include <QtCore/QTime>
#include <QtCore/QVector>

namespace gallery
{
/// Model with one row for each signal: time, object, signal, arguments. It keeps the latest s_maximumRows.
/// Each signal also goes as one line to the log file, if there is one:
///     14:05:12.345 pad.swiped(gesturePad)
class SignalLog : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum Column : int
    {
        cTime,
        cObject,
        cSignal,
        cArguments,
        cCount
    };

    static const int s_maximumRows = 1000;

    explicit SignalLog(QObject* parent = nullptr);
    ~SignalLog() override;

    /// Lines are appended and flushed one by one. False if the file cannot be written.
    bool openFile(const QString& path);

    /// Records all signals that the object's classes declare below QObject and QWidget, until it dies.
    void watch(QObject* object, const QString& name, const QStringList& chatty = {});

    void record(const QString& object, const QString& signal, const QString& arguments, bool chatty);
    /// A line "# text" in the file; not shown.
    void writeComment(const QString& text);

    /// Whether repetitions of chatty signals share one row. On at first; the file always has every signal.
    bool foldsRepetitions() const { return m_folds; }
    void setFoldsRepetitions(bool folds) { m_folds = folds; }

    void clear();

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    int columnCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    struct Row
    {
        QTime time;
        QString object;
        QString signal;
        QString arguments;
        int repetitions;
        bool chatty;
    };

    bool fold(const QString& object, const QString& signal, const QString& arguments, QTime now);

    QVector<Row> m_rows;
    QFile m_file;
    bool m_folds = true;
};
}
