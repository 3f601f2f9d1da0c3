/**
 * Times in ticks of 45 kHz. They may need 64 bits, so they are BigInt everywhere; only the picture works with
 * milliseconds, because it draws pixels.
 */

export const TicksPerSecond = 45000n;
export const TicksPerMillisecond = 45n;

/**
 * hours:minutes:seconds.milliseconds, truncated, as the desk player writes them.
 * @param {bigint} ticks
 * @returns {string}
 */
export function formatTime(ticks) {
  const sign = ticks < 0n ? '-' : '';
  const milliseconds = (ticks < 0n ? -ticks : ticks) / TicksPerMillisecond;
  const two = (/** @type {bigint} */ value) => String(value).padStart(2, '0');
  const seconds = milliseconds / 1000n;
  return `${sign}${two(seconds / 3600n)}:${two((seconds / 60n) % 60n)}:${two(seconds % 60n)}.${
    String(milliseconds % 1000n).padStart(3, '0')}`;
}

/**
 * A duration without leading zeros: 0.041 s, 2:05 min, 8:00:00 h.
 * @param {bigint} ticks not negative
 * @returns {string}
 */
export function formatDuration(ticks) {
  const seconds = ticks / TicksPerSecond;
  const two = (/** @type {bigint} */ value) => String(value).padStart(2, '0');
  if (seconds >= 3600n) {
    return `${seconds / 3600n}:${two((seconds / 60n) % 60n)}:${two(seconds % 60n)} h`;
  }
  if (seconds >= 60n) {
    return `${seconds / 60n}:${two(seconds % 60n)} min`;
  }
  return `${seconds}.${String((ticks / TicksPerMillisecond) % 1000n).padStart(3, '0')} s`;
}

/**
 * Whether a parsed JSON value is an integer, and therefore can be a time.
 * @param {unknown} value
 * @returns {value is number | bigint}
 */
export function isInteger(value) {
  return typeof value === 'bigint' || Number.isSafeInteger(value);
}
