-- Where do resumes fail?
--
-- Of a title that a menu had suspended, and of the system after standby.

SELECT
    play_list,
    firmware,
    CASE WHEN name IN ('Resumed', 'ResumeFailed') THEN 'suspension' ELSE 'standby' END AS resumed_from,
    SUM(CASE WHEN name IN ('ResumeFailed', 'SystemResumeFailed') THEN 1 ELSE 0 END) AS failed,
    COUNT(*) AS resumes,
    ROUND(100.0 * SUM(CASE WHEN name IN ('ResumeFailed', 'SystemResumeFailed') THEN 1 ELSE 0 END)
              / COUNT(*), 1) AS percent
FROM records
WHERE name IN ('Resumed', 'ResumeFailed', 'SystemResumed', 'SystemResumeFailed')
GROUP BY play_list, firmware,
         CASE WHEN name IN ('Resumed', 'ResumeFailed') THEN 'suspension' ELSE 'standby' END
ORDER BY failed DESC, play_list, firmware, resumed_from;
