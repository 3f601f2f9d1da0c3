/**
 * @file
 * Reads the arguments of a callback.
 */
#ifndef DESKPLAYER_RECORDING_ARGUMENTREADER_H
#define DESKPLAYER_RECORDING_ARGUMENTREADER_H

#include <charconv>
#include <limits>
#include <string>
#include <type_traits>
#include <vector>

#include "clientkit/names.h"
#include "output/record.h"
#include "recording/element.h"

namespace deskplayer
{

/**
 * A visitor that assigns the members of an object to the arguments of a callback. What has no
 * member gets its neutral value: zero, false, the enumerator 0, no position, nothing forbidden, a
 * program without commands, an empty block.
 */
class ArgumentReader
{
public:
    /** @param arguments must outlive the reader */
    explicit ArgumentReader(const Element& arguments) : m_rArguments(arguments) {}

    /** @throw Unreadable the member has another type, or is out of range */
    template <typename Value> void operator()(const char* name, Value& value)
    {
        if (Take(name)) {
            Read(m_rArguments.Member(name), value);
        } else {
            SetNeutral(value);
        }
    }

    /** Keeps the bytes, see Block(): a callback only refers to them. */
    void operator()(const char* name, const bdmv::Bytes& /*value*/)
    {
        if (Take(name)) {
            ReadBlock(m_rArguments.Member(name));
        }
    }

    /** @throw Unreadable the object has a member that is no argument; call it at the end */
    void ExpectNoOthers(const std::string& callback) const;

    ArgumentSet Absent() const { return m_Absent; }

    std::vector<bd::UInt8> TakeBlock() { return std::move(m_Block); }

private:
    bool Take(const char* name);

    void Read(const Element& element, bool& value) const;
    void Read(const Element& element, bd::TimePosition& value) const;
    void Read(const Element& element, bd::ZoomRectangleDef& value) const;
    void Read(const Element& element, bdmv::UOMaskTable& value) const;
    void Read(const Element& element, bdmv::IProgramData::RefPtr& value) const;
    void ReadBlock(const Element& element);

    template <typename Value>
    std::enable_if_t<std::is_unsigned_v<Value>> Read(const Element& element, Value& value) const
    {
        value = static_cast<Value>(element.Number(std::numeric_limits<Value>::max()));
    }

    template <typename Value>
    std::enable_if_t<std::is_enum_v<Value>> Read(const Element& element, Value& value) const
    {
        if (!FindEnumerator(element.Text(), value)) {
            element.Refuse("a name, or in quotes the number of a value without a name");
        }
    }

    /** By its name or, for a value without one, by its number. */
    template <typename Enumeration>
    static bool FindEnumerator(const std::string& text, Enumeration& value)
    {
        for (const auto& entry : bdmv::NamesOf<Enumeration>()) {
            if (text == entry.name) {
                value = entry.code;
                return true;
            }
        }
        std::underlying_type_t<Enumeration> number = 0;
        std::from_chars(text.data(), text.data() + text.size(), number);
        value = static_cast<Enumeration>(number);
        return text == std::to_string(number) && bdmv::NameOf(value) == nullptr;
    }

    /** Arguments are zero before they are read. */
    template <typename Value> void SetNeutral(Value& /*value*/) const {}
    void SetNeutral(bd::TimePosition& value) const;
    void SetNeutral(bdmv::IProgramData::RefPtr& value) const;

    const Element& m_rArguments;
    std::vector<std::string> m_Names; ///< of the arguments so far
    ArgumentSet m_Absent;
    std::vector<bd::UInt8> m_Block;
};

} // namespace deskplayer

#endif
