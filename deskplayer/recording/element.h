/**
 * @file
 * A value of a line's JSON, and the members that lead to it.
 *
 * @code
 * const Element line(json);
 * const std::uint64_t x = line.Member("arguments").Member("clip").Member("x").Number(65535);
 * @endcode
 *
 * Every operation that expects something else throws Unreadable, which names the place.
 */
#ifndef DESKPLAYER_RECORDING_ELEMENT_H
#define DESKPLAYER_RECORDING_ELEMENT_H

#include <cstdint>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

namespace deskplayer
{

/** A value is not what was expected. */
struct Unreadable {
    std::vector<std::string> path; ///< the names of the members that lead to it
    std::string message;           ///< what was found and what was expected
};

/** Refers to its value and to the element that contains it, which must both live longer. */
class Element
{
public:
    explicit Element(const nlohmann::json& line) : m_rValue(line) {}

    const nlohmann::json& Value() const { return m_rValue; }

    /** Whether an object has a member. @throw Unreadable not an object */
    bool Has(const char* name) const;

    /** @throw Unreadable not an object, or without this member */
    Element Member(const std::string& name) const;

    /** @throw Unreadable not a boolean */
    bool Boolean() const;

    /** @throw Unreadable not an integer from 0 to @p greatest */
    std::uint64_t Number(std::uint64_t greatest) const;

    /** @throw Unreadable not a string */
    const std::string& Text() const;

    /** The strings of an array. @throw Unreadable not an array of strings */
    std::vector<std::string> Texts() const;

    /** @throw Unreadable always */
    [[noreturn]] void Refuse(const std::string& expected) const;

private:
    Element(const nlohmann::json& value, const Element& parent, std::string name)
        : m_rValue(value), m_pParent(&parent), m_Name(std::move(name))
    {
    }

    [[noreturn]] void Throw(const std::string& message) const;

    const nlohmann::json& m_rValue;
    const Element* m_pParent = nullptr;
    std::string m_Name; ///< in its parent
};

} // namespace deskplayer

#endif
