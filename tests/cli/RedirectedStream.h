// SPDX-License-Identifier: MIT
#pragma once

#include <unistd.h>

/** Puts another file in place of one of the program's standard streams while it lives. */
class RedirectedStream
{
public:
    RedirectedStream(int stream, int replacement)
        : m_stream(stream)
        , m_original(dup(stream))
    {
        dup2(replacement, m_stream);
    }
    ~RedirectedStream()
    {
        dup2(m_original, m_stream);
        close(m_original);
    }
    RedirectedStream(const RedirectedStream &) = delete;
    RedirectedStream &operator=(const RedirectedStream &) = delete;

private:
    int m_stream;
    int m_original;
};
