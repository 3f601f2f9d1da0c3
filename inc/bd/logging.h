/**
 * @file
 * Diagnostic log lines: the components that write them, their levels, and the writer.
 *
 * @code
 * constexpr bd::LogTag Diagnostic = {bd::CompIdBdmvNavigator, KEVRO_Log_LevelWarning, 0};
 * BD_LOG(Diagnostic, "play item %u has no stream table", playItemId);
 * @endcode
 *
 * Levels: a line's level is a value of bd::LogLevelDef or of KEVRO_Log_Level; both have the same
 * values. LogHighFrequency is not a line's level: high frequency is the separate flag.
 *
 * Cost: while the platform's switch is off for the tag, a line costs one call of
 * KEVRO_Log_IsEnabled() and a test; its arguments are not evaluated. While it is on, the writer is
 * three words on the stack. Nothing here allocates, and nothing limits the length of a line.
 *
 * Threads: everything may be used from several threads at once; a VargLogger belongs to one thread.
 *
 * Errors: none are reported. A line that cannot be written is dropped by the platform.
 */
#ifndef BD_LOGGING_H
#define BD_LOGGING_H

#include "bd/macros.h"
#include "kevro/kevro_log.h"
#include "kevro/kevro_types.h"

namespace bd
{

/** The components that write log lines. The numbers 42 and 76 are not in use. */
enum CompIdDef : KEVRO_Int32 {
    CompIdBdavArchiver = 32,
    CompIdBdavDiscManager = 33,
    CompIdBdavEditor = 34,
    CompIdBdavInformation = 35,
    CompIdBdavNavigator = 36,
    CompIdBdavReplicator = 37,
    CompIdBdavSystem = 38,
    CompIdBdavFactory = 39,
    CompIdBdavDatabase = 40,
    CompIdCommon = 41,
    CompIdFileManager = 43,
    CompIdImageProcessor = 44,
    CompIdScheduler = 45,
    CompIdStreamer = 46,
    CompIdDecoder = 47,
    CompIdStreamGateway = 48,
    CompIdStreamParser = 49,
    CompIdIgDecoder = 50,
    CompIdPgDecoder = 51,
    CompIdTsDecoder = 52,
    CompIdReader = 53,
    CompIdTest = 54,
    CompIdBdmvDiscManager = 55,
    CompIdBdmvInformation = 56,
    CompIdBdmvNavigator = 57,
    CompIdBdmvSystem = 58,
    CompIdBdmvFactory = 59,
    CompIdBdmvDatabase = 60,
    CompIdBdmvUserEventManager = 61,
    CompIdBdmvHdmv = 62,
    CompIdBdmvCommandProcessor = 63,
    CompIdBdmvModuleManager = 64,
    CompIdBdmvCache = 65,
    CompIdBdmvJavaModule = 66,
    CompIdJpiConnector = 67,
    CompIdJbiConnector = 68,
    CompIdBdioSystem = 69,
    CompIdBdioDiscRecognition = 70,
    CompIdBdioVfs = 71,
    CompIdBdSystem = 72,
    CompIdBdj = 73,
    CompIdBdmvBdjAdapter = 74,
    CompIdJpi = 75,
    CompIdJbiGraphics = 77,
    CompIdJbiIo = 78,
    CompIdJbiMedia = 79,
    CompIdJbiMisc = 80,
    CompIdJbiOsa = 81,
    CompIdJbiTi = 82,
    CompId__sizeof = 83 ///< one past the last
};

/** Sub-components; none are defined. */
enum SubCompIdDef : KEVRO_Int32 { SubCompId__sizeof = 0 };

/** Levels of a log line. The values are those of KEVRO_Log_Level. */
enum LogLevelDef : KEVRO_Int32 {
    LogMethod = 0,
    LogInterface = 1,
    LogException = 2,
    LogWarning = 3,
    LogState = 4,
    LogEvent = 5,
    LogInfo = 6,
    LogFree1 = 7,
    LogFree2 = 8,
    LogFree3 = 9,
    LogFree4 = 10,
    LogDefault = 11,
    LogRuntime = 12,
    LogFatal = 13,
    LogLevel__sizeof = 14, ///< number of levels; not a level
    LogHighFrequency = 16  ///< marks high-frequency logging; not a level of a line
};

// A level may come from either enumeration, so a difference would silently change its meaning.
static_assert(static_cast<KEVRO_Int32>(LogMethod) == KEVRO_Log_LevelMethod, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogInterface) == KEVRO_Log_LevelInterface,
              "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogException) == KEVRO_Log_LevelException,
              "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogWarning) == KEVRO_Log_LevelWarning, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogState) == KEVRO_Log_LevelState, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogEvent) == KEVRO_Log_LevelEvent, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogInfo) == KEVRO_Log_LevelInfo, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogFree1) == KEVRO_Log_LevelFree1, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogFree2) == KEVRO_Log_LevelFree2, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogFree3) == KEVRO_Log_LevelFree3, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogFree4) == KEVRO_Log_LevelFree4, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogDefault) == KEVRO_Log_LevelDefault, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogRuntime) == KEVRO_Log_LevelRuntime, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogFatal) == KEVRO_Log_LevelFatal, "one list of levels");
static_assert(static_cast<KEVRO_Int32>(LogLevel__sizeof) == KEVRO_Log_Level__sizeof,
              "one list of levels");
static_assert(sizeof(KEVRO_Log_Level) == 4, "layout of the writer");

/** Component, level and high-frequency flag, by which a line is switched on and labelled. */
struct LogTag {
    KEVRO_UInt32 component; ///< a CompIdDef value
    KEVRO_Int32 level;      ///< a LogLevelDef or KEVRO_Log_Level value
    KEVRO_Bool hiFreq;      ///< non-zero for high-frequency lines
};

/** Writes lines under one component, level and high-frequency flag. Lives on the stack. */
class VargLogger
{
public:
    /**
     * Stores the three values and does nothing else.
     *
     * @param userId a CompIdDef value
     * @param level  the level of every line written
     * @param hiFreq non-zero for high-frequency lines
     */
    VargLogger(KEVRO_UInt32 userId, KEVRO_Log_Level level, KEVRO_Bool hiFreq)
        : m_UserId(userId), m_Level(level), m_HiFreq(hiFreq)
    {
    }

    /** The same, with a level from the library's own enumeration: any but LogHighFrequency. */
    VargLogger(KEVRO_UInt32 userId, LogLevelDef level, KEVRO_Bool hiFreq)
        : VargLogger(userId, static_cast<KEVRO_Log_Level>(level), hiFreq)
    {
    }

    /**
     * Formats and writes one line, without checking the switch; see BD_LOG() for that.
     *
     * @param format a printf format without a line end, then its arguments
     */
    void Log(const char* format, ...) BD_PRINTF_FORMAT(2, 3);

private:
    KEVRO_UInt32 m_UserId;
    KEVRO_Log_Level m_Level;
    KEVRO_Bool m_HiFreq;
};

} // namespace bd

#endif
