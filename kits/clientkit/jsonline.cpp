#include "clientkit/jsonline.h"

#include "bd/constants.h"

namespace bdmv
{

JsonLine::JsonLine(JsonSink sink, void* user)
    : m_Sink(sink), m_pUser(user), m_pSeparator(""), m_Size(0)
{
}

void JsonLine::Begin(bd::UInt64 ticks, CallbackId id)
{
    AddText(R"({"ticks":)");
    AddNumber(ticks);
    AddText(R"(,"time":")");
    AddTime(ticks);
    AddText(R"(","interface":")");
    AddText(NameOf(InterfaceOf(id)));
    AddText(R"(","callback":")");
    AddText(NameOf(id));
    AddText(R"(","arguments":{)");
}

void JsonLine::BeginBytes(const char* name)
{
    AddName(name);
    AddByte('"');
}

void JsonLine::AddBytes(const bd::UInt8* bytes, std::size_t size)
{
    static const char digits[] = "0123456789abcdef";
    for (std::size_t i = 0; i < size; ++i) {
        AddByte(digits[bytes[i] >> 4]);
        AddByte(digits[bytes[i] & 0x0F]);
    }
}

void JsonLine::EndBytes()
{
    AddByte('"');
}

void JsonLine::End()
{
    AddText("}}\n");
    Flush();
}

void JsonLine::Gap(bd::UInt64 ticks, bd::UInt64 lost, const char* cause)
{
    BeginGap(ticks);
    AddText(R"("lost":)");
    AddNumber(lost);
    AddByte(',');
    EndGap(cause);
}

void JsonLine::Gap(bd::UInt64 ticks, const char* cause)
{
    BeginGap(ticks);
    EndGap(cause);
}

void JsonLine::BeginGap(bd::UInt64 ticks)
{
    AddText(R"({"ticks":)");
    AddNumber(ticks);
    AddText(R"(,"gap":{)");
}

void JsonLine::EndGap(const char* cause)
{
    AddText(R"("cause":")");
    AddText(cause);
    AddText("\"}}\n");
    Flush();
}

void JsonLine::AddName(const char* name)
{
    AddText(m_pSeparator);
    m_pSeparator = ",";
    AddByte('"');
    AddText(name);
    AddText("\":");
}

void JsonLine::Add(bool value)
{
    AddText(value ? "true" : "false");
}

void JsonLine::Add(bd::TimePosition value)
{
    if (value == bd::TimePositionNone) {
        AddText("null");
    } else {
        AddNumber(value);
    }
}

void JsonLine::Add(const bd::ZoomRectangleDef& value)
{
    AddText(R"({"x":)");
    AddNumber(value.X);
    AddText(R"(,"y":)");
    AddNumber(value.Y);
    AddText(R"(,"width":)");
    AddNumber(value.Width);
    AddText(R"(,"height":)");
    AddNumber(value.Height);
    AddByte('}');
}

void JsonLine::Add(const UOMaskTable& value)
{
    const bd::UInt64 forbidden = value.GetUOMaskTable();
    const char* separator = "";
    AddByte('[');
    for (bd::Int32 bit = 0; bit < 8 * UOMaskTable::UO_MASK_TABLE_SIZE; ++bit) {
        if (((forbidden >> bit) & 1) != 0) {
            AddText(separator);
            separator = ",";
            Add(static_cast<bd::UserOperationMaskDef>(bit));
        }
    }
    AddByte(']');
}

void JsonLine::Add(const Bytes& value)
{
    AddByte('"');
    AddBytes(static_cast<const bd::UInt8*>(value.data), value.data == nullptr ? 0 : value.size);
    AddByte('"');
}

void JsonLine::Add(const IProgramData::RefPtr& value)
{
    AddNumber(value ? value->GetNumberOfNavigationCommands() : 0);
}

void JsonLine::AddEnumerator(const char* name, bd::Int64 value)
{
    AddByte('"');
    if (name != nullptr) {
        AddText(name);
    } else if (value < 0) {
        AddByte('-');
        AddNumber(static_cast<bd::UInt64>(-value));
    } else {
        AddNumber(static_cast<bd::UInt64>(value));
    }
    AddByte('"');
}

// Not by the standard library's formatting, which depends on the locale or allocates.
void JsonLine::AddNumber(bd::UInt64 number, int digits)
{
    char reversed[20]; // as many as the greatest number has
    int count = 0;
    while (number != 0 || count < digits) {
        reversed[count++] = static_cast<char>('0' + number % 10);
        number /= 10;
    }
    while (count != 0) {
        AddByte(reversed[--count]);
    }
}

void JsonLine::AddTime(bd::UInt64 ticks)
{
    const bd::UInt64 milliseconds = ticks / 45;
    const bd::UInt64 seconds = milliseconds / 1000;
    AddNumber(seconds / 3600, 2);
    AddByte(':');
    AddNumber(seconds / 60 % 60, 2);
    AddByte(':');
    AddNumber(seconds % 60, 2);
    AddByte('.');
    AddNumber(milliseconds % 1000, 3);
}

void JsonLine::AddText(const char* text)
{
    for (; *text != '\0'; ++text) {
        AddByte(*text);
    }
}

void JsonLine::AddByte(char byte)
{
    if (m_Size == sizeof m_Buffer) {
        Flush();
    }
    m_Buffer[m_Size++] = byte;
}

void JsonLine::Flush()
{
    m_Sink(m_pUser, m_Buffer, m_Size);
    m_Size = 0;
}

void WriteJsonLine(bd::UInt64 ticks, const Callback& callback, JsonSink sink, void* user)
{
    JsonLine line(sink, user);
    line.Begin(ticks, callback.Id());
    callback.VisitArguments(line);
    line.End();
}

} // namespace bdmv
