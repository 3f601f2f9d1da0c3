-- How long is skipping forbidden?
--
-- A mask is in force until the next one. The end of playback, standby and a gap end it too; so does the
-- end of the log.

WITH limits AS (
    SELECT log, line, ticks, play_list, COALESCE(forbids_skipping, FALSE) AS forbids
    FROM records
    WHERE name IN ('UOMask', 'PlayFailed', 'Stopped', 'Finished', 'ResumeFailed',
                   'SystemSuspended', '(gap)')
    UNION ALL
    SELECT log, MAX(line) + 1, MAX(ticks), NULL, FALSE
    FROM records
    GROUP BY log
),
changes AS (
    SELECT *, LAG(forbids, 1, FALSE) OVER (PARTITION BY log ORDER BY line) AS forbade
    FROM limits
),
periods AS (
    SELECT
        play_list,
        forbids,
        LEAD(ticks) OVER (PARTITION BY log ORDER BY line) - ticks AS duration
    FROM changes
    WHERE forbids <> forbade
)
SELECT
    play_list,
    COUNT(*) AS periods,
    ROUND(SUM(duration) / 45000.0, 3) AS total_s,
    ROUND(AVG(duration) / 45000.0, 3) AS mean_s,
    ROUND(MAX(duration) / 45000.0, 3) AS longest_s
FROM periods
WHERE forbids
GROUP BY play_list
ORDER BY total_s DESC, play_list;
