#include "check/clips.h"

namespace deskplayer
{

ClipContents::ClipContents(const ClipInfo& clipInfo)
{
    for (const AtcSequence& atcSequence : clipInfo.atcSequences) {
        unsigned number = atcSequence.firstStcSequence;
        for (const StcSequence& sequence : atcSequence.stcSequences) {
            m_Sequences.emplace(number++, sequence);
        }
    }
    for (const Program& program : clipInfo.programs) {
        for (const ProgramStream& stream : program.streams) {
            m_CodingTypes.emplace(stream.pid, stream.attributes.codingType);
        }
    }
}

const StcSequence* ClipContents::FindSequence(std::uint8_t number) const
{
    const auto sequence = m_Sequences.find(number);
    return sequence == m_Sequences.end() ? nullptr : &sequence->second;
}

std::optional<std::uint8_t> ClipContents::FindCodingType(std::uint16_t pid) const
{
    const auto codingType = m_CodingTypes.find(pid);
    return codingType == m_CodingTypes.end() ? std::nullopt : std::optional(codingType->second);
}

} // namespace deskplayer
