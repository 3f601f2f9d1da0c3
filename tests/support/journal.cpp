#include "support/journal.h"

#include <utility>

namespace bdmvtest
{

void Journal::Add(const std::string& entry)
{
    const std::lock_guard<std::mutex> lock(m_Mutex);
    m_Text += entry;
    m_Text += '\n';
}

std::string Journal::Take()
{
    const std::lock_guard<std::mutex> lock(m_Mutex);
    return std::exchange(m_Text, std::string());
}

} // namespace bdmvtest
