#include <cstdlib>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "kevro_linux.h"
#include "logchannel.h"
#include "settings.h"
#include "sinks.h"

namespace kevro
{

namespace
{

/** A number given as `name=number` after the name of a sink. */
struct Option {
    const char* name;
    bool forFilesOnly;
    long long smallest;
    long long largest;
    long long defaultValue;
    std::optional<long long> given;

    std::size_t Value() const { return static_cast<std::size_t>(given.value_or(defaultValue)); }
};

struct Options {
    Option size = {"size", true, 1, 0x7FFFFFFF, 1048576, std::nullopt};
    Option files = {"files", true, 0, 1000, 3, std::nullopt};
    Option queue = {"queue", false, 1, 65536, 0, std::nullopt};

    void Read(const Word& word, bool forFile)
    {
        const std::size_t equals = word.text.find('=');
        const Word name = word.Part(0, equals);
        for (Option* option : {&size, &files, &queue}) {
            if (name.text != option->name || (option->forFilesOnly && !forFile)) {
                continue;
            }
            if (option->given) {
                name.RefuseBecause("given twice");
            }
            const Word value =
                word.Part(equals == std::string_view::npos ? word.text.size() : equals + 1);
            option->given = value.Number(option->smallest, option->largest);
            return;
        }
        name.Refuse(forFile ? "size=BYTES, files=N or queue=LINES" : "queue=LINES");
    }
};

Destination OpenDestination(const char* text)
{
    const std::vector<Word> words = Word::Whole(text).Split(',');
    const std::size_t colon = words[0].text.find(':');
    const Word kind = words[0].Part(0, colon);
    std::optional<Word> argument;
    if (colon != std::string_view::npos) {
        argument = words[0].Part(colon + 1);
    }

    Options options;
    for (auto word = words.begin() + 1; word != words.end(); ++word) {
        options.Read(*word, kind.text == "file");
    }

    std::unique_ptr<spdlog::sinks::sink> sink;
    if (kind.text == "stderr" && !argument) {
        sink = MakeStderrSink();
    } else if (kind.text == "file" && argument && !argument->text.empty()) {
        sink =
            MakeFileSink(std::string(argument->text), options.size.Value(), options.files.Value());
    } else if (kind.text == "syslog" && (!argument || !argument->text.empty())) {
        sink = MakeSyslogSink(std::string(argument ? argument->text : std::string_view()));
    } else {
        words[0].Refuse("stderr, file:PATH, syslog or syslog:IDENT");
    }
    return {std::move(sink), options.queue.Value()};
}

LogChannel& MakeLogChannel()
{
    Destination destination;
    if (!ApplyEnvironment("KEVRO_LOG_SINK",
                          [&](const char* text) { destination = OpenDestination(text); })) {
        destination = OpenDestination("stderr");
    }
    std::atexit([] { TheLogChannel().Finish(); });
    return *new LogChannel(std::move(destination));
}

// Created at start in any case, so that an error in the environment is reported then.
[[maybe_unused]] const LogChannel& g_rStarted = TheLogChannel();

} // namespace

LogChannel& TheLogChannel()
{
    static LogChannel& channel = MakeLogChannel();
    return channel;
}

} // namespace kevro

bool KEVRO_Log_ConfigureSink(const char* text, char* message, size_t messageSize)
{
    return kevro::Apply(
        [](const char* sink) { kevro::TheLogChannel().Exchange(kevro::OpenDestination(sink)); },
        text, message, messageSize);
}

KEVRO_UInt64 KEVRO_Log_GetDroppedLines(void)
{
    return kevro::TheLogChannel().CountLost();
}

void KEVRO_Log_Flush(void)
{
    kevro::TheLogChannel().Flush();
}
