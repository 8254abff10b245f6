#include "project/NumberedSections.h"

#include <algorithm>
#include <cstring>
#include <limits>

void NumberedSections::add(const char *name, int length)
{
    int digits = length;
    while (digits > 0 && name[digits - 1] >= '0' && name[digits - 1] <= '9')
        --digits;
    const int numberLength = length - digits;
    if (numberLength == 0 || numberLength > 10 || (numberLength > 1 && name[digits] == '0'))
        return;
    int64_t number = 0;
    for (int i = digits; i < length; ++i)
        number = number * 10 + (name[i] - '0');
    if (number > std::numeric_limits<int32_t>::max())
        return;

    if (!m_last || m_lastStem.size() != digits || std::memcmp(m_lastStem.constData(), name, size_t(digits)) != 0) {
        m_lastStem = QByteArray(name, digits);
        m_last = &m_numbers[m_lastStem];
    }
    if (!m_last->empty() && m_last->back() >= number)
        m_sorted = false;
    m_last->push_back(int32_t(number));
}

void NumberedSections::add(const QString &name)
{
    QByteArray latin1;
    latin1.reserve(name.size());
    for (const QChar c : name) {
        if (c.unicode() > 0xFF)
            return;
        latin1.append(char(c.unicode()));
    }
    add(latin1.constData(), latin1.size());
}

std::vector<int32_t> NumberedSections::below(const QString &stem, int32_t count)
{
    if (!m_sorted) {
        for (std::vector<int32_t> &numbers : m_numbers) {
            std::sort(numbers.begin(), numbers.end());
            numbers.erase(std::unique(numbers.begin(), numbers.end()), numbers.end());
        }
        m_sorted = true;
    }
    const auto found = m_numbers.constFind(stem.toLatin1());
    if (found == m_numbers.constEnd())
        return {};
    const std::vector<int32_t> &numbers = *found;
    return std::vector<int32_t>(numbers.begin(), std::lower_bound(numbers.begin(), numbers.end(), count));
}
