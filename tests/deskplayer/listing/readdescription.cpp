#include "readdescription.h"

#include <map>
#include <optional>
#include <sstream>
#include <stdexcept>
#include <vector>

namespace deskplayer
{

namespace
{

using nlohmann::json;

std::string WithoutMeanings(const std::string& text)
{
    std::string rest;
    int depth = 0;
    for (const char character : text) {
        depth += character == '(';
        if (depth == 0) {
            rest += character;
        }
        depth -= character == ')';
    }
    return rest;
}

/** Converts \xNN to the byte it represents. */
std::string Unescaped(const std::string& text)
{
    std::string bytes;
    for (std::size_t at = 0; at < text.size(); ++at) {
        if (text[at] == '\\') {
            bytes += static_cast<char>(std::stoi(text.substr(at + 2, 2), nullptr, 16));
            at += 3;
        } else {
            bytes += text[at];
        }
    }
    return bytes;
}

/** A parsed line: its depth, "mark", "3", and its fields. */
class Line
{
public:
    explicit Line(const std::string& text)
    {
        const std::size_t begin = text.find_first_not_of(' ');
        m_Depth = begin / 2;
        const std::size_t colon = text.find(": ");
        if (colon == std::string::npos) {
            throw std::runtime_error("a line without fields: " + text);
        }
        m_Label = text.substr(begin, colon - begin);
        const std::size_t digit = m_Label.find_first_of("0123456789");
        if (digit != std::string::npos) {
            m_Number = std::stoul(m_Label.substr(digit));
            m_Label.resize(digit - 1);
        }
        std::istringstream fields(WithoutMeanings(text.substr(colon + 2)));
        for (std::string field; std::getline(fields, field, ',');) {
            m_Fields.push_back(field.substr(field.find_first_not_of(' ')));
        }
    }

    std::size_t Depth() const { return m_Depth; }
    const std::string& Label() const { return m_Label; }
    std::size_t Number() const { return m_Number; }

    bool Has(const std::string& name) const { return Find(name).has_value(); }

    std::string Text(const std::string& name) const
    {
        const std::optional<std::string> value = Find(name);
        if (!value) {
            throw std::runtime_error("no " + name + " of " + m_Label);
        }
        return value->substr(0, value->find_last_not_of(' ') + 1);
    }

    std::uint64_t Value(const std::string& name) const
    {
        return std::stoull(Text(name), nullptr, 0);
    }

    std::uint64_t Decimal(const std::string& name) const { return std::stoull(Text(name)); }

    json DecimalOrNull(const std::string& name) const
    {
        return Text(name) == "none" ? json(nullptr) : json(Decimal(name));
    }

    bool YesNo(const std::string& name) const
    {
        const std::string text = Text(name);
        if (text != "yes" && text != "no") {
            throw std::runtime_error(name + " is " + text);
        }
        return text == "yes";
    }

    /** Converts numbers counted from 1 to numbers counted from 0. */
    json Numbers(const std::string& name) const
    {
        json numbers = json::array();
        if (Text(name) != "none") {
            std::istringstream words(Text(name));
            for (int number = 0; words >> number;) {
                numbers.push_back(number - 1);
            }
        }
        return numbers;
    }

private:
    std::optional<std::string> Find(const std::string& name) const
    {
        for (const std::string& field : m_Fields) {
            if (field.rfind(name + ' ', 0) == 0) {
                return field.substr(name.size() + 1);
            }
        }
        return std::nullopt;
    }

    std::size_t m_Depth = 0;
    std::string m_Label;
    std::size_t m_Number = 0;
    std::vector<std::string> m_Fields;
};

std::string LowerCase(std::string text)
{
    for (char& character : text) {
        character = static_cast<char>(std::tolower(static_cast<unsigned char>(character)));
    }
    return text;
}

json Clip(const Line& line)
{
    return {{"clip", line.Text("clip")},
            {"codec", Unescaped(line.Text("codec"))},
            {"stc_id", line.Decimal("STC sequence")}};
}

json ClipAndConnection(const Line& line, const char* clips)
{
    json item = Clip(line);
    item[clips] = json::array({item});
    item["connection_condition"] = line.Decimal("connection condition");
    return item;
}

/** A value that only some streams have. */
struct OptionalValue {
    const char* name;
    const char* key;
};

const OptionalValue g_StreamValues[] = {
    {"sub path", "sub_path"},
    {"clip", "sub_clip"},
    {"format", "video_format"},
    {"rate", "frame_rate"},
    {"aspect", "aspect"},
    {"dynamic range", "dynamic_range"},
    {"colour space", "colour_space"},
    {"presentation", "audio_presentation"},
    {"sample rate", "sample_rate"},
    {"character code", "character_code"},
};

const OptionalValue g_References[] = {
    {"primary audio", "primary_audio_refs"},
    {"secondary audio", "secondary_audio_refs"},
    {"picture-in-picture subtitles", "pip_pg_refs"},
};

json StreamOf(const Line& line)
{
    json stream{{"entry_type", line.Decimal("entry type")},
                {"pid", line.Value("PID")},
                {"coding_type", line.Value("coding type")}};
    for (const OptionalValue& value : g_StreamValues) {
        if (line.Has(value.name)) {
            stream[value.key] = line.DecimalOrNull(value.name);
        }
    }
    if (line.Has("HDR flag")) {
        stream["hdr_flags"] = line.YesNo("HDR flag") << 1 | int(line.YesNo("dynamic metadata"));
    }
    if (line.Has("language")) {
        const std::string language = line.Text("language");
        stream["language"] = language == "none" ? "" : Unescaped(language);
    }
    for (const OptionalValue& value : g_References) {
        if (line.Has(value.name)) {
            stream[value.key] = line.Numbers(value.name);
        }
    }
    return stream;
}

const std::map<std::string, const char*> g_StreamKinds = {
    {"primary video", "video"},
    {"primary audio", "audio"},
    {"subtitles", "pg"},
    {"picture-in-picture subtitles", "pip_pg"},
    {"menu", "ig"},
    {"secondary audio", "secondary_audio"},
    {"secondary video", "secondary_video"},
    {"enhancement video", "dv"},
};

/** Appends to a list; the line must have the next number. */
void Append(json& list, const Line& line, std::size_t first, const json& value)
{
    if (line.Number() != list.size() + first) {
        throw std::runtime_error(line.Label() + " has number " + std::to_string(line.Number()));
    }
    list.push_back(value);
}

class Reader
{
public:
    json Read(const std::string& description)
    {
        std::istringstream lines(description);
        for (std::string text; std::getline(lines, text);) {
            const Line line(text);
            switch (line.Depth()) {
            case 0:
            case 1:
                ReadPart(line);
                break;
            case 2:
                m_InSubPath ? ReadSubPlayItem(line) : ReadPlayItem(line);
                break;
            default:
                ReadSubPlayItem(line);
            }
        }
        return m_PlayList;
    }

private:
    void ReadPart(const Line& line)
    {
        const std::string& label = line.Label();
        if (label == "play list") {
            m_PlayList["version"] = line.Text("version");
            m_PlayList["playback_type"] = line.Decimal("playback type");
            m_PlayList["playback_count"] = line.Decimal("playback count");
            m_PlayList["duration"] = line.Decimal("duration");
            for (const char* list : {"items", "sub_paths", "marks", "chapters", "extension"}) {
                m_PlayList[list] = json::array();
            }
        } else if (label == "flags") {
            m_PlayList["random_access"] = int(line.YesNo("random access flag"));
            m_PlayList["audio_mix"] = int(line.YesNo("audio mixing"));
            m_PlayList["lossless_bypass"] = int(line.YesNo("lossless bypass"));
            m_PlayList["mvc_base_view_r"] = int(line.YesNo("base view is right eye"));
        } else if (label == "user operations") {
            m_PlayList["uo_mask"] = LowerCase(line.Text("mask"));
        } else if (label == "play item") {
            json item = ClipAndConnection(line, "angles");
            item["multi_angle"] = false;
            for (const auto& kind : g_StreamKinds) {
                item["streams"][kind.second] = json::array();
            }
            Append(m_PlayList["items"], line, 0, item);
        } else if (label == "sub path") {
            m_InSubPath = true;
            Append(m_PlayList["sub_paths"], line, 0,
                   {{"type", line.Decimal("type")},
                    {"repeat", line.YesNo("repeat")},
                    {"items", json::array()}});
        } else if (label == "mark") {
            Append(m_PlayList["marks"], line, 0,
                   {{"type", line.Decimal("type")},
                    {"item", line.Decimal("play item")},
                    {"time", line.Decimal("time")},
                    {"es_pid", line.Value("PID")},
                    {"duration", line.Decimal("duration")},
                    {"position", line.DecimalOrNull("position")}});
        } else if (label == "chapter") {
            m_PlayList["chapters"].push_back({{"number", line.Number()},
                                              {"start", line.Decimal("start")},
                                              {"end", line.Decimal("end")},
                                              {"mark", line.Decimal("mark")}});
        } else if (label == "extension block") {
            const std::string kind = line.Text("kind");
            const std::size_t point = kind.find('.');
            Append(m_PlayList["extension"], line, 0,
                   {{"id", {std::stoi(kind.substr(0, point)), std::stoi(kind.substr(point + 1))}},
                    {"offset", line.Decimal("offset")},
                    {"length", line.Decimal("size")}});
        } else {
            throw std::runtime_error("an unknown line: " + label);
        }
    }

    void ReadTime(const Line& line, json& item)
    {
        item["in"] = line.Decimal("IN");
        item["out"] = line.Decimal("OUT");
        if (line.Decimal("duration") != line.Decimal("OUT") - line.Decimal("IN")) {
            throw std::runtime_error("a duration that is not OUT - IN");
        }
    }

    void ReadPlayItem(const Line& line)
    {
        json& item = m_PlayList["items"].back();
        const std::string& label = line.Label();
        if (label == "time") {
            ReadTime(line, item);
            item["start"] = line.Decimal("start");
        } else if (label == "still") {
            item["still_mode"] = line.Decimal("mode");
            item["still_time"] = line.Decimal("seconds");
        } else if (label == "flags") {
            item["random_access"] = int(line.YesNo("random access flag"));
        } else if (label == "user operations") {
            item["uo_mask"] = LowerCase(line.Text("mask"));
        } else if (label == "angles") {
            item["multi_angle"] = true;
            item["different_audios"] = line.YesNo("different audios");
            item["seamless_angle_change"] = line.YesNo("seamless change");
        } else if (label == "angle") {
            Append(item["angles"], line, 1, Clip(line));
        } else {
            const auto kind = g_StreamKinds.find(label);
            if (kind == g_StreamKinds.end()) {
                throw std::runtime_error("an unknown line of a play item: " + label);
            }
            Append(item["streams"][kind->second], line, 1, StreamOf(line));
        }
    }

    void ReadSubPlayItem(const Line& line)
    {
        json& items = m_PlayList["sub_paths"].back()["items"];
        const std::string& label = line.Label();
        if (label == "sub play item") {
            Append(items, line, 0, ClipAndConnection(line, "clips"));
        } else if (label == "time") {
            ReadTime(line, items.back());
        } else if (label == "starts") {
            items.back()["sync_item"] = line.Decimal("play item");
            items.back()["sync_pts"] = line.Decimal("at");
        } else if (label == "clip") {
            Append(items.back()["clips"], line, 0, Clip(line));
        } else {
            throw std::runtime_error("an unknown line of a sub path: " + label);
        }
    }

    json m_PlayList;
    bool m_InSubPath = false;
};

} // namespace

json ReadDescription(const std::string& description)
{
    return Reader().Read(description);
}

} // namespace deskplayer
