#include "ProgressBar.h"

#include <unistd.h>

#include <cstdio>

ProgressBar::ProgressBar(uint64_t total) : m_Total(total), m_Terminal(isatty(STDERR_FILENO) != 0) {}

ProgressBar::~ProgressBar() {
    if (m_Shown) std::fprintf(stderr, "\r%60s\r", "");
}

void ProgressBar::Update(uint64_t done) {
    if (!m_Terminal || m_Total == 0) return;
    const Clock::time_point now = Clock::now();
    if (now - m_Start < std::chrono::seconds(1) || now - m_Drawn < std::chrono::milliseconds(250)) return;
    m_Drawn = now;
    m_Shown = true;
    const int width = 40;
    const int filled = static_cast<int>(static_cast<double>(done) / static_cast<double>(m_Total) * width);
    std::fprintf(stderr, "\rreading [%-*.*s] %3d%%", width, filled, "########################################",
                 static_cast<int>(done * 100 / m_Total));
    std::fflush(stderr);
}
