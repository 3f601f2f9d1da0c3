/**
 * @file
 * The two macros of the base layer: the printf-format attribute and the log guard.
 */
#ifndef BD_MACROS_H
#define BD_MACROS_H

/**
 * Lets the compiler check the arguments of a printf-like function against its format.
 *
 * @param formatIndex   position of the format among the parameters, from 1; a member function's
 *                      implicit object counts
 * @param argumentIndex position of the first argument to check
 */
#if defined(__GNUC__)
#define BD_PRINTF_FORMAT(formatIndex, argumentIndex)                                               \
    __attribute__((format(printf, formatIndex, argumentIndex)))
#else
#define BD_PRINTF_FORMAT(formatIndex, argumentIndex)
#endif

/**
 * Writes one log line if, and only if, the platform's log switch is on for it.
 *
 * A macro because the arguments must not be evaluated while the switch is off: work that only the
 * line needs goes into its arguments and then costs nothing. Include "bd/logging.h" to use it.
 *
 * @code
 * BD_LOG(Notification, "Sending Playlist - playListId: %lu", static_cast<unsigned long>(id));
 * @endcode
 *
 * @param tag a bd::LogTag: component, level and high-frequency flag of the line
 * @param ... a printf format and its arguments
 */
#define BD_LOG(tag, ...)                                                                           \
    do {                                                                                           \
        if (KEVRO_Log_IsEnabled((tag).component, (tag).level, (tag).hiFreq) != 0) {                \
            bd::VargLogger((tag).component, static_cast<bd::LogLevelDef>((tag).level),             \
                           (tag).hiFreq)                                                           \
                .Log(__VA_ARGS__);                                                                 \
        }                                                                                          \
    } while (false)

#endif
