#include "scratchdisc.h"

#include <unistd.h>

#include "../disc/testdiscs.h"

namespace deskplayer
{

namespace fs = std::filesystem;

ScratchDisc::ScratchDisc(const std::string& original)
    : m_Folder(fs::temp_directory_path() / ("scratch-disc-" + std::to_string(getpid())))
{
    fs::remove_all(m_Folder);
    fs::copy(TestDisc(original), m_Folder, fs::copy_options::recursive);
}

ScratchDisc::~ScratchDisc()
{
    std::error_code error;
    fs::remove_all(m_Folder, error);
}

void ScratchDisc::Write(const std::string& name, const Bytes& content) const
{
    WriteBytes(m_Folder / "BDMV" / name, content);
}

void ScratchDisc::Remove(const std::string& name) const
{
    fs::remove(m_Folder / "BDMV" / name);
}

} // namespace deskplayer
