#pragma once

#include <QByteArray>
#include <QHash>
#include <QString>

#include <cstdint>
#include <vector>

// The sections of a file whose names end in a number, grouped by the text before
// the number: "keypoint12" is number 12 of "keypoint". Lists are stored as such
// sections, and a list that lost a section in the middle still has the rest.
// A number with a leading zero ("keypoint012") names no entry of a list.
class NumberedSections
{
public:
    NumberedSections() = default;
    NumberedSections(const NumberedSections &) = delete;
    NumberedSections &operator=(const NumberedSections &) = delete;

    void add(const char *name, int length); // Latin-1
    void add(const QString &name);

    // The numbers below `count` that `stem` has, ascending and each once.
    std::vector<int32_t> below(const QString &stem, int32_t count);

private:
    QHash<QByteArray, std::vector<int32_t>> m_numbers;
    std::vector<int32_t> *m_last = nullptr; // files list an entry after the one before
    QByteArray m_lastStem;
    bool m_sorted = true;
};
