/**
 * @file
 * The results, as tables with ratios and goals.
 */
#ifndef BENCH_TABLES_H
#define BENCH_TABLES_H

#include "report.h"

namespace bench
{

/** Prints all tables, then which goals are met. */
void PrintTables(const Report& report);

} // namespace bench

#endif
