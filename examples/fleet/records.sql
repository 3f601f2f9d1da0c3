-- Reads JSON lines of the desk player into the table that the questions in this folder are put to.
--
--   SET VARIABLE recordings = 'recordings/**/*.jsonl';
--   .read examples/fleet/records.sql
--
-- Only this file depends on DuckDB. The table "records" has a row for every line:
--
--   log          the file that the line is in
--   line         orders the lines of a log
--   ticks        the time in the log: 45 per millisecond
--   device, firmware    tags
--   name         the callback, '(gap)' or '(start)'
--   interface    of the callback
--   play_list    the play list that is played at this time; null if it is not known
--   forbids_skipping    of a UOMask: whether the user may not skip to the next point
--   cause, lost  of a gap

CREATE OR REPLACE TEMP TABLE lines AS
SELECT
    filename AS log,
    row_number() OVER () AS line,
    CAST(ticks AS BIGINT) AS ticks,
    tags['device'] AS device,
    tags['firmware'] AS firmware,
    CASE WHEN gap IS NOT NULL THEN '(gap)'
         WHEN "start" IS NOT NULL THEN '(start)'
         ELSE callback
    END AS name,
    interface,
    CASE WHEN callback = 'Playlist' THEN CAST(arguments ->> '$.playListId' AS BIGINT)
    END AS next_play_list,
    CASE WHEN callback = 'UOMask'
         THEN list_contains(CAST(arguments -> '$.forbidden' AS VARCHAR[]), 'SkipToNextPoint')
    END AS forbids_skipping,
    gap.cause AS cause,
    gap.lost AS lost
FROM read_ndjson(
    getvariable('recordings'),
    filename = true,
    columns = {
        ticks: 'UBIGINT',
        interface: 'VARCHAR',
        callback: 'VARCHAR',
        arguments: 'JSON',
        gap: 'STRUCT(lost UBIGINT, cause VARCHAR)',
        "start": 'STRUCT("wallClock" VARCHAR)',
        tags: 'MAP(VARCHAR, VARCHAR)'
    });

CREATE OR REPLACE TABLE records AS
SELECT
    log, line, ticks, device, firmware, name, interface,
    -- A part begins with a play list, or with a gap, in which any may have begun.
    MAX(next_play_list) OVER (PARTITION BY log, part) AS play_list,
    forbids_skipping, cause, lost
FROM (
    SELECT *, SUM(CASE WHEN name IN ('Playlist', '(gap)') THEN 1 ELSE 0 END)
                  OVER (PARTITION BY log ORDER BY line) AS part
    FROM lines
) AS parts;
