/**
 * @file
 * The destinations of log lines. Each can be used by several threads and throws a std::exception
 * when it cannot write a line.
 */
#ifndef KEVRO_SINKS_H
#define KEVRO_SINKS_H

#include <cstddef>
#include <memory>
#include <string>

#include <spdlog/sinks/sink.h>

namespace kevro
{

std::unique_ptr<spdlog::sinks::sink> MakeStderrSink();

/** Opens the file in an existing directory; throws when that fails. See KEVRO_Log_ConfigureSink()
 * for the parameters. */
std::unique_ptr<spdlog::sinks::sink> MakeFileSink(const std::string& path, std::size_t size,
                                                  std::size_t files);

/** @param ident the name in the system's log; empty for the program's name */
std::unique_ptr<spdlog::sinks::sink> MakeSyslogSink(const std::string& ident);

} // namespace kevro

#endif
