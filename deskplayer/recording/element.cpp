#include "recording/element.h"

#include <algorithm>

#include "text/printable.h"

namespace deskplayer
{

namespace
{

using nlohmann::json;

/** @p value as a message shows it. */
std::string ShortenedValue(const json& value)
{
    constexpr std::size_t longest = 40;
    if (value.is_object()) {
        return "object";
    }
    if (value.is_array()) {
        return "array";
    }
    const std::string text = value.dump();
    return text.size() <= longest ? text : std::string(FirstCharacters(text, longest)) + "...";
}

} // namespace

bool Element::Has(const char* name) const
{
    if (!m_rValue.is_object()) {
        Refuse("an object");
    }
    return m_rValue.contains(name);
}

Element Element::Member(const std::string& name) const
{
    if (!Has(name.c_str())) {
        Throw("missing member '" + name + "'");
    }
    return {m_rValue.at(name), *this, name};
}

bool Element::Boolean() const
{
    if (!m_rValue.is_boolean()) {
        Refuse("true or false");
    }
    return m_rValue.get<bool>();
}

std::uint64_t Element::Number(std::uint64_t greatest) const
{
    if (!m_rValue.is_number_unsigned() || m_rValue.get<std::uint64_t>() > greatest) {
        Refuse("an integer from 0 to " + std::to_string(greatest));
    }
    return m_rValue.get<std::uint64_t>();
}

const std::string& Element::Text() const
{
    if (!m_rValue.is_string()) {
        Refuse("a string");
    }
    return m_rValue.get_ref<const std::string&>();
}

std::vector<std::string> Element::Texts() const
{
    if (!m_rValue.is_array()) {
        Refuse("an array of strings");
    }
    std::vector<std::string> texts;
    for (const json& value : m_rValue) {
        if (!value.is_string()) {
            Refuse("an array of strings");
        }
        texts.push_back(value.get<std::string>());
    }
    return texts;
}

void Element::Refuse(const std::string& expected) const
{
    Throw("unexpected " + ShortenedValue(m_rValue) + "; expected " + expected);
}

void Element::Throw(const std::string& message) const
{
    std::vector<std::string> path;
    for (const Element* element = this; element->m_pParent != nullptr;
         element = element->m_pParent) {
        path.push_back(element->m_Name);
    }
    std::reverse(path.begin(), path.end());
    throw Unreadable{path, message};
}

} // namespace deskplayer
