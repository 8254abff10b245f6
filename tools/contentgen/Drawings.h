#pragma once

#include <QByteArray>
#include <QSettings>
#include <QString>

// The drawings of one content folder: "svg/<stem>.svg" by default, or what the
// section of the stem in "drawings.ini" says. In an SVG, "{{key}}" is replaced
// by the section's value of that key; a value "@file.svg" inserts that file of
// "svg/", itself with the same replacements.
class Drawings
{
public:
    explicit Drawings(const QString &sourceFolder);

    // The drawing named by key ("svg" unless told) for the stem, ready for the
    // SVG renderer; empty with a trace line if a file or a value is missing.
    QByteArray svg(const QString &stem, const QString &key = QStringLiteral("svg")) const;

    QString value(const QString &stem, const QString &key, const QString &fallback = QString()) const;
    bool has(const QString &stem, const QString &key) const;

private:
    QByteArray readSvgFile(const QString &name) const;
    QByteArray substitute(QByteArray text, const QString &stem, int depth) const;

    QString m_svgFolder;
    QSettings::SettingsMap m_values;
};
