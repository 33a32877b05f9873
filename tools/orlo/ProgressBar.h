#pragma once
/// A progress bar on stderr for a long read: shown only when stderr is a
/// terminal and the work has taken more than a second, redrawn a few times a
/// second, and wiped at the end.
#include <chrono>
#include <cstdint>

class ProgressBar {
public:
    explicit ProgressBar(uint64_t total);
    ~ProgressBar();

    ProgressBar(const ProgressBar&) = delete;
    ProgressBar& operator=(const ProgressBar&) = delete;

    void Update(uint64_t done);

private:
    using Clock = std::chrono::steady_clock;
    uint64_t m_Total;
    bool m_Terminal;
    bool m_Shown = false;
    Clock::time_point m_Start = Clock::now();
    Clock::time_point m_Drawn = m_Start;
};
