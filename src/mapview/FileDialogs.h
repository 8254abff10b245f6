#pragma once

#include <QString>

class QWidget;

// The file dialogs of the project commands. The program asks the user; tests answer
// in their place. An empty result means the dialog was cancelled.
class FileDialogs
{
public:
    virtual ~FileDialogs() = default;

    virtual QString openFileName(const QString &title, const QString &folder, const QString &filter) = 0;
    // `proposedName` is a full path without extension; the first "*.ext" of `filter`
    // is added to a name typed without one.
    virtual QString saveFileName(const QString &title, const QString &proposedName, const QString &filter) = 0;
};

// The toolkit's dialogs, modal over `parent`.
class QtFileDialogs : public FileDialogs
{
public:
    explicit QtFileDialogs(QWidget *parent = nullptr) : m_parent(parent) {}

    void setParent(QWidget *parent) { m_parent = parent; }

    QString openFileName(const QString &title, const QString &folder, const QString &filter) override;
    QString saveFileName(const QString &title, const QString &proposedName, const QString &filter) override;

private:
    QWidget *m_parent;
};
