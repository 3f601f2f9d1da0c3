/**
 * @file
 * Names of the enumerators that callbacks carry, as all outputs write them.
 *
 * @code
 * bdmv::NameOf(bd::PlaySpeedFast2); // "Fast2"; null for a value without a name
 *
 * for (const auto& entry : bdmv::NamesOf<bd::PlaySpeedDef>()) {
 *     menu.Add(entry.name, entry.code);
 * }
 * @endcode
 *
 * All names are printable ASCII without quotes and backslashes. Any thread may call everything
 * here.
 */
#ifndef CLIENTKIT_NAMES_H
#define CLIENTKIT_NAMES_H

#include <type_traits>

#include "bd/types.h"
#include "bdmvnavigator/inavcontrollistener.h"

namespace bdmv
{

/** An enumerator and its name. */
template <typename Enumeration> struct EnumeratorName {
    Enumeration code; ///< the enumerator
    const char* name; ///< as outputs write it
};

/** All named enumerators of an enumeration, in order of their values. */
template <typename Enumeration> class EnumeratorNames
{
public:
    /** The entries from @p first up to, but not including, @p last. */
    EnumeratorNames(const EnumeratorName<Enumeration>* first,
                    const EnumeratorName<Enumeration>* last)
        : m_pFirst(first), m_pLast(last)
    {
    }

    /** The first entry. */
    const EnumeratorName<Enumeration>* begin() const { return m_pFirst; }

    /** The end of the entries. */
    const EnumeratorName<Enumeration>* end() const { return m_pLast; }

private:
    const EnumeratorName<Enumeration>* m_pFirst;
    const EnumeratorName<Enumeration>* m_pLast;
};

/** The names of an enumeration: one of those below, the enumerations that callbacks carry. */
template <typename Enumeration> EnumeratorNames<Enumeration> NamesOf();

/** @{ */
/** All that are named. */
template <> EnumeratorNames<bd::PlayDirectionDef> NamesOf<bd::PlayDirectionDef>();
template <> EnumeratorNames<bd::PlaySpeedDef> NamesOf<bd::PlaySpeedDef>();
template <> EnumeratorNames<bd::TriggerType> NamesOf<bd::TriggerType>();
template <> EnumeratorNames<bd::VideoFormatType> NamesOf<bd::VideoFormatType>();
template <> EnumeratorNames<bd::VideoAspectRatioType> NamesOf<bd::VideoAspectRatioType>();
template <> EnumeratorNames<bd::AudioFormatType> NamesOf<bd::AudioFormatType>();
template <> EnumeratorNames<bd::AudioSampleRateType> NamesOf<bd::AudioSampleRateType>();
template <> EnumeratorNames<bd::AudioBitsPerSamplingType> NamesOf<bd::AudioBitsPerSamplingType>();
template <> EnumeratorNames<bd::AudioChannelType> NamesOf<bd::AudioChannelType>();
template <> EnumeratorNames<bd::UserOperationMaskDef> NamesOf<bd::UserOperationMaskDef>();
template <>
EnumeratorNames<INavControlListener::FinishedReason> NamesOf<INavControlListener::FinishedReason>();
/** @} */

/**
 * The name of an enumerator; null for a value without one.
 *
 * @tparam Enumeration one of those above
 */
template <typename Enumeration,
          typename = typename std::enable_if<std::is_enum<Enumeration>::value>::type>
const char* NameOf(Enumeration value)
{
    for (const EnumeratorName<Enumeration>& entry : NamesOf<Enumeration>()) {
        if (entry.code == value) {
            return entry.name;
        }
    }
    return nullptr;
}

} // namespace bdmv

#endif
