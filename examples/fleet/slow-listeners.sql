-- Which firmware's listeners are slowest?
--
-- An event writes a line, calls all listeners, and only then writes its next line. So the time from
-- PlayItem or PlayMode to the availability that the same event reports is the time that the listeners
-- took. Other callbacks are not suitable: the next line is of another event, which may come much
-- later.

WITH neighbours AS (
    SELECT
        firmware,
        name,
        LAG(name, 1) OVER (PARTITION BY log ORDER BY line) AS previous,
        LAG(name, 2) OVER (PARTITION BY log ORDER BY line) AS one_before,
        ticks - LAG(ticks) OVER (PARTITION BY log ORDER BY line) AS wait
    FROM records
),
waits AS (
    SELECT firmware, previous AS callback, wait
    FROM neighbours
    WHERE (name IN ('PictureInPictureAvailable', 'PictureInPictureUnavailable',
                    'SecondaryAudioAvailable', 'SecondaryAudioUnavailable')
           AND previous IN ('PlayItem', 'PlayMode'))
       OR (name IN ('SecondaryAudioAvailable', 'SecondaryAudioUnavailable')
           AND previous IN ('PictureInPictureAvailable', 'PictureInPictureUnavailable')
           AND one_before IN ('PlayItem', 'PlayMode'))
)
SELECT
    firmware,
    callback,
    COUNT(*) AS waits,
    ROUND(AVG(wait) / 45.0, 3) AS mean_ms,
    ROUND(MAX(wait) / 45.0, 3) AS longest_ms
FROM waits
GROUP BY firmware, callback
ORDER BY mean_ms DESC, firmware, callback;
