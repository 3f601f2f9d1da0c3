#include "recording/recordline.h"

#include <algorithm>
#include <limits>
#include <string>

#include "recording/argumentreader.h"
#include "recording/element.h"
#include "recording/linejson.h"
#include "text/timetext.h"

namespace deskplayer
{

namespace
{

namespace callbacks = bdmv::callbacks;

bdmv::CallbackId ReadCallbackId(const Element& element)
{
    for (int id = 0; id < bdmv::Callback__sizeof; ++id) {
        if (element.Text() == NameOf(static_cast<bdmv::CallbackId>(id))) {
            return static_cast<bdmv::CallbackId>(id);
        }
    }
    element.Refuse("the name of a callback");
}

/** Reads a member that repeats another one, and may be missing. */
void ExpectIfPresent(const Element& line, const char* name, const std::string& expected)
{
    if (line.Has(name) && line.Member(name).Text() != expected) {
        line.Member(name).Refuse('"' + expected + '"');
    }
}

template <typename Arguments> bdmv::Callback ReadAs(ArgumentReader& reader)
{
    Arguments arguments{};
    Arguments::VisitArguments(arguments, reader);
    return arguments;
}

bdmv::Callback ReadCallback(bdmv::CallbackId id, ArgumentReader& reader)
{
    static bdmv::Callback (*const functions[])(ArgumentReader&) = {
#define DESKPLAYER_READ(interface, name) &ReadAs<callbacks::name>,
        BDMV_CALLBACKS(DESKPLAYER_READ)
#undef DESKPLAYER_READ
    };
    return functions[id](reader);
}

/** Makes the callback refer to the block, which may be shorter than the callback's size. */
void AttachBlock(CallbackRecord& record, const std::vector<bd::UInt8>& block,
                 const Element& arguments)
{
    const auto* const suspended = record.callback.As<callbacks::SystemSuspended>();
    if (suspended == nullptr) {
        return;
    }
    const auto known = static_cast<bd::UInt32>(block.size());
    const bd::UInt32 size = arguments.Has("size") ? suspended->size : known;
    if (known > size) {
        arguments.Member("size").Refuse("at least " + std::to_string(known) +
                                        ", the bytes in 'data'");
    }
    if (known < size) {
        record.knownBytes = known;
    }
    record.callback = callbacks::SystemSuspended{known == 0 ? nullptr : block.data(), size};
}

CallbackRecord ReadCallbackRecord(const Element& line, Ticks time, std::vector<bd::UInt8>& block)
{
    const bdmv::CallbackId id = ReadCallbackId(line.Member("callback"));
    ExpectIfPresent(line, "time", TimeText(time));
    ExpectIfPresent(line, "interface", NameOf(InterfaceOf(id)));

    const Element arguments = line.Member("arguments");
    ArgumentReader reader(arguments);
    const bdmv::Callback callback = ReadCallback(id, reader);
    reader.ExpectNoOthers(NameOf(id));
    block = reader.TakeBlock();
    CallbackRecord record = {time, callback, reader.Absent()};
    AttachBlock(record, block, arguments);
    return record;
}

/** Text is restricted to what every output can write as it is. */
const std::string& ReadWritableText(const Element& element)
{
    const std::string& text = element.Text();
    const bool writable = std::all_of(text.begin(), text.end(), [](char character) {
        return character >= ' ' && character <= '~' && character != '"' && character != '\\';
    });
    if (!writable) {
        element.Refuse("printable ASCII without quotes and backslashes");
    }
    return text;
}

Tags ReadTags(const Element& line)
{
    Tags tags;
    if (line.Has("tags")) {
        const Element element = line.Member("tags");
        if (!element.Value().is_object()) {
            element.Refuse("an object of strings");
        }
        for (const auto& tag : element.Value().items()) {
            tags.emplace(tag.key(), element.Member(tag.key()).Text());
        }
    }
    return tags;
}

GapRecord ReadGap(const Element& element, Ticks time)
{
    GapRecord gap = {time, ReadWritableText(element.Member("cause")), std::nullopt};
    if (element.Has("lost")) {
        gap.lost = element.Member("lost").Number(std::numeric_limits<std::uint64_t>::max());
    }
    return gap;
}

StartRecord ReadStart(const Element& element, Ticks time)
{
    return {time, ReadWritableText(element.Member("wallClock"))};
}

/** Reads everything but the tags. */
Record ReadRecord(const Element& line, std::vector<bd::UInt8>& block)
{
    const Ticks time(line.Member("ticks").Number(std::numeric_limits<std::uint64_t>::max()));
    if (line.Has("gap")) {
        return ReadGap(line.Member("gap"), time);
    }
    if (line.Has("start")) {
        return ReadStart(line.Member("start"), time);
    }
    return ReadCallbackRecord(line, time, block);
}

} // namespace

Record ReadRecordLine(std::string_view line, std::vector<bd::UInt8>& block)
{
    const nlohmann::json json = ParseLine(line);
    try {
        const Element root(json);
        Record record = ReadRecord(root, block);
        std::visit([&root](auto& read) { read.tags = ReadTags(root); }, record);
        return record;
    } catch (const Unreadable& error) {
        throw LineError{ColumnOf(line, error.path), error.message};
    }
}

} // namespace deskplayer
