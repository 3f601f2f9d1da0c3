#include "disc/clipinfo.h"

#include <algorithm>

#include "disc/codes.h"
#include "disc/fields.h"

namespace deskplayer
{

namespace
{

constexpr std::size_t SmallestAtcSequence = 6;
constexpr std::size_t StcSequenceSize = 14;
constexpr std::size_t SmallestProgram = 8;
constexpr std::size_t SmallestProgramStream = 4;

StcSequence ReadStcSequence(ByteReader& reader)
{
    StcSequence sequence;
    sequence.pcrPid = reader.UInt16("PID of the clock reference");
    sequence.firstPacket = reader.UInt32("first packet of the STC sequence");
    sequence.presentationStart = reader.UInt32("presentation start time");
    const std::size_t offset = reader.Offset();
    sequence.presentationEnd = reader.UInt32("presentation end time");
    if (sequence.presentationEnd < sequence.presentationStart) {
        reader.Fail(offset, "presentation end time is " + std::to_string(sequence.presentationEnd),
                    "at least the start time " + std::to_string(sequence.presentationStart));
    }
    return sequence;
}

std::vector<AtcSequence> ReadSequenceInfo(ByteReader section)
{
    section.Skip(1, "padding");
    std::vector<AtcSequence> sequences(
        section.Count8(SmallestAtcSequence, "number of ATC sequences"));
    for (AtcSequence& sequence : sequences) {
        sequence.firstPacket = section.UInt32("first packet of the ATC sequence");
        sequence.stcSequences.resize(section.Count8(StcSequenceSize, "number of STC sequences"));
        sequence.firstStcSequence = section.UInt8("number of the first STC sequence");
        for (StcSequence& stcSequence : sequence.stcSequences) {
            stcSequence = ReadStcSequence(section);
        }
    }
    return sequences;
}

void ReadVideoAttributes(ByteReader& codingInfo, ProgramStream& stream)
{
    ReadVideoFormat(codingInfo, stream.attributes);
    const std::uint8_t ratioAndFlags = codingInfo.UInt8("aspect ratio");
    stream.aspectRatio = HighHalf(ratioAndFlags);
    stream.captionFlag = Bit(ratioAndFlags, 6);
    if (stream.attributes.codingType == CodingTypeH265) {
        stream.attributes.hdrFlag = Bit(ratioAndFlags, 7);
        ReadDynamicRange(codingInfo, stream.attributes);
        stream.attributes.dynamicMetadata = Bit(codingInfo.UInt8("dynamic metadata flag"), 0);
    }
}

ProgramStream ReadProgramStream(ByteReader& section, std::size_t number)
{
    ProgramStream stream;
    stream.pid = section.UInt16("PID of the stream");
    ByteReader codingInfo = section.TakePart8({"coding info of stream", number});
    stream.attributes.codingType = codingInfo.UInt8("coding type");
    if (KindOfStream(stream.attributes.codingType) == StreamKindVideo) {
        ReadVideoAttributes(codingInfo, stream);
    } else {
        ReadAttributesOtherThanVideo(codingInfo, stream.attributes);
    }
    return stream;
}

std::vector<Program> ReadProgramInfo(ByteReader section)
{
    section.Skip(1, "padding");
    std::vector<Program> programs(section.Count8(SmallestProgram, "number of programs"));
    for (Program& program : programs) {
        program.firstPacket = section.UInt32("first packet of the program");
        program.programMapPid = section.UInt16("PID of the program map");
        program.streams.resize(section.Count8(SmallestProgramStream, "number of streams"));
        section.Skip(1, "padding");
        for (std::size_t number = 0; number < program.streams.size(); ++number) {
            program.streams[number] = ReadProgramStream(section, number);
        }
    }
    return programs;
}

} // namespace

ClipInfo ParseClipInfo(const Bytes& bytes, const std::string& fileName)
{
    ByteReader file(bytes, fileName);
    ClipInfo clipInfo;
    clipInfo.version = ReadTypeAndVersion(file, "HDMV");
    clipInfo.atcSequences = ReadSequenceInfo(file.PartAtAddress(FileHeaderSize, {"sequence info"}));
    clipInfo.programs = ReadProgramInfo(file.PartAtAddress(FileHeaderSize, {"program info"}));
    file.Skip(FileHeaderSize - file.Offset(), "header");

    ByteReader body = file.TakePart32({"clip info"});
    body.Skip(2, "padding");
    clipInfo.clipStreamType = body.UInt8("clip stream type");
    clipInfo.applicationType = body.UInt8("application type");
    clipInfo.arrivalTimeOffsets = Bit(body.UInt32("arrival time offset flag"), 31);
    clipInfo.greatestDataRate = body.UInt32("greatest data rate");
    clipInfo.packets = body.UInt32("number of packets");
    return clipInfo;
}

Ticks Duration(const ClipInfo& clipInfo)
{
    Ticks duration(0);
    for (const AtcSequence& atcSequence : clipInfo.atcSequences) {
        for (const StcSequence& sequence : atcSequence.stcSequences) {
            duration += Ticks(sequence.presentationEnd - sequence.presentationStart);
        }
    }
    return duration;
}

std::vector<std::pair<std::uint16_t, std::uint8_t>> AspectRatiosOf(const ClipInfo& clipInfo)
{
    std::vector<std::pair<std::uint16_t, std::uint8_t>> ratios;
    for (const Program& program : clipInfo.programs) {
        for (const ProgramStream& stream : program.streams) {
            if (KindOfStream(stream.attributes.codingType) == StreamKindVideo) {
                ratios.emplace_back(stream.pid, stream.aspectRatio);
            }
        }
    }
    const auto byPid = [](const auto& left, const auto& right) { return left.first < right.first; };
    const auto samePid = [](const auto& left, const auto& right) {
        return left.first == right.first;
    };
    std::stable_sort(ratios.begin(), ratios.end(), byPid);
    ratios.erase(std::unique(ratios.begin(), ratios.end(), samePid), ratios.end());
    ratios.shrink_to_fit();
    return ratios;
}

} // namespace deskplayer
