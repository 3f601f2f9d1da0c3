-- What was lost?
--
-- The gaps of each cause. A gap that does not say how many lines it lacks counts only as a gap.

SELECT
    cause,
    firmware,
    device,
    COUNT(*) AS gaps,
    SUM(lost) AS lost_lines,
    SUM(CASE WHEN lost IS NULL THEN 1 ELSE 0 END) AS gaps_of_unknown_size,
    COUNT(DISTINCT log) AS logs
FROM records
WHERE name = '(gap)'
GROUP BY cause, firmware, device
ORDER BY lost_lines DESC NULLS LAST, gaps DESC, cause, firmware, device;
