/**
 * @file
 * The command line of the program.
 */
#ifndef DESKPLAYER_PROGRAM_OPTIONS_H
#define DESKPLAYER_PROGRAM_OPTIONS_H

#include <CLI/CLI.hpp>

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace deskplayer
{

/** The largest value of --jobs. */
constexpr unsigned MostJobs = 256;

/** The values given on the command line. */
struct Options {
    std::string disc;
    std::optional<std::uint32_t> playList;
    bool list = false;
    bool check = false;
    std::optional<std::uint32_t> describe;
    std::string session;
    bool strict = false;
    bool realTime = false;
    bool remote = false;
    std::string replay;
    bool fill = false;
    std::string format = "text";
    std::string output;
    std::string compare;
    std::string page;
    std::string listen;
    std::string only;
    std::optional<std::string> log;
    std::vector<std::string> fieldLogs;
    std::optional<std::string> logPrefix;
    std::vector<std::string> tags;
    std::string outputFolder;
    std::optional<unsigned> jobs;
    bool summary = false;
};

/** Declares every option, its help and its conflicts. @param options receives the values */
void AddOptions(CLI::App& app, Options& options);

} // namespace deskplayer

#endif
