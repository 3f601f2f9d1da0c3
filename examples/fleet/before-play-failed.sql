-- What precedes PlayFailed?
--
-- The two callbacks of the control interface before each PlayFailed, and how often the same two were
-- followed by another one: a sequence that always fails is a better clue than one that often occurs.

WITH steps AS (
    SELECT
        name,
        COALESCE(LAG(name, 2) OVER (PARTITION BY log ORDER BY line), '(none)') AS one_before,
        COALESCE(LAG(name, 1) OVER (PARTITION BY log ORDER BY line), '(none)') AS previous
    FROM records
    WHERE interface = 'control' OR name = '(gap)'
)
SELECT
    one_before,
    previous,
    SUM(CASE WHEN name = 'PlayFailed' THEN 1 ELSE 0 END) AS failed,
    COUNT(*) AS occurred,
    ROUND(100.0 * SUM(CASE WHEN name = 'PlayFailed' THEN 1 ELSE 0 END) / COUNT(*), 1) AS percent
FROM steps
GROUP BY one_before, previous
HAVING SUM(CASE WHEN name = 'PlayFailed' THEN 1 ELSE 0 END) > 0
ORDER BY failed DESC, one_before, previous;
