#pragma once

#include <cstdint>

// Hands out the ids of one kind of object: 1, 2, ... and after the largest
// 32-bit value 1 again, since 0 stands for "none" wherever an id is kept.
class IdCounter
{
public:
    explicit IdCounter(uint32_t next = 1) : m_next(next) {}

    uint32_t draw()
    {
        if (m_next == 0)
            m_next = 1;
        return m_next++;
    }

private:
    uint32_t m_next;
};
