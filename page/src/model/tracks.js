/**
 * Which callbacks begin and end the slices of which tracks: the same tracks, slices and names as in the trace that
 * the desk player writes. tests/trace.test.js compares both.
 */

/** @typedef {import('./recording.js').Entry} Entry */

/** The tracks of slices, from top to bottom. */
export const SliceTracks = [
  'playback', 'play mode', 'play list', 'play item', 'chapter', 'video', 'audio', 'subtitles', 'angle',
  'interactive graphics', 'secondary video', 'secondary audio', 'picture-in-picture subtitles', 'menu',
];

/** The tracks of instants, below those of slices: every line of a recording is an instant on one of them. */
export const InstantTracks = ['control', 'settings', 'button', 'interactive', 'gaps', 'starts'];

/** What ends when playback ends. Streams and the angle stay selected. */
const PlaybackTracks = ['playback', 'play mode', 'play list', 'play item', 'chapter'];

/**
 * What an effect may ask about the slices so far.
 * @typedef {object} State
 * @property {(track: string) => string | undefined} current the name of the track's slice, if one is open
 * @property {string} beforeSuspension the name of the slice of playback that Suspended ended
 *
 * What a callback does to a track: it begins the slice `begins` there, or ends the one that is open.
 * @typedef {object} Effect
 * @property {string} [on] the track; without it all tracks of playback
 * @property {(entry: Entry, state: State) => string | null | undefined} [begins] the name of the slice; null ends the
 *   open slice, undefined changes nothing. Without it the callback ends the open slice
 * @property {string} because
 */

/** @param {string} name */
const always = (name) => () => name;

/**
 * A state whose name depends on arguments is unknown if an argument is absent.
 * @param {Entry} entry
 * @param {() => string | null} name
 */
const ifComplete = (entry, name) => (entry.absent.length > 0 ? null : name());

/**
 * @param {string} track
 * @param {string} argument
 * @param {string} because
 * @returns {Effect}
 */
const numbered = (track, argument, because) => ({
  on: track,
  begins: (entry) => ifComplete(entry, () => `${track} ${entry.values[argument]}`),
  because,
});

/**
 * @param {string} track
 * @param {string} argument
 * @returns {Effect}
 */
const counted = (track, argument) => ({
  on: track,
  begins: (entry) => ifComplete(entry, () => (
    entry.values[argument] === 0 ? null : `${track} ${entry.values[argument]}`)),
  because: 'Numbers count from 1; 0 means that none is selected.',
});

const endsPlayback = 'Playback has ended.';

/** @type {Readonly<Record<string, Effect>>} */
export const Effects = {
  PlayStarted: { on: 'playback', begins: always('Playing'), because: 'Playback has begun.' },
  Continued: { on: 'playback', begins: always('Playing'), because: 'Playback moves again.' },
  Paused: { on: 'playback', begins: always('Paused'), because: 'The picture stands still by request.' },
  StillOn: { on: 'playback', begins: always('Still'), because: 'The disc holds the picture.' },
  StillOff: {
    on: 'playback',
    begins: (_, state) => (state.current('playback') === 'Still' ? 'Playing' : undefined),
    because: 'Only a still is left; a pause or an end lasts.',
  },
  Suspended: { on: 'playback', begins: always('Suspended'), because: 'Another title plays meanwhile.' },
  Resumed: {
    on: 'playback',
    begins: (_, state) => state.beforeSuspension,
    because: 'The state from before the suspension returns.',
  },
  SystemSuspended: { on: 'playback', begins: always('Standby'), because: 'The player is in standby.' },
  SystemResumed: {
    begins: (entry) => (entry.values.playing === true ? 'Playing' : null),
    because: 'Playback continues after standby, or has ended in it.',
  },
  PlayFailed: { because: endsPlayback },
  Stopped: { because: endsPlayback },
  Finished: { because: endsPlayback },
  ResumeFailed: { because: endsPlayback },
  SystemResumeFailed: { because: endsPlayback },
  PlayMode: {
    on: 'play mode',
    begins: (entry) => ifComplete(entry, () => `${entry.values.direction} ${entry.values.speed}`),
    because: 'Direction and speed last until the next mode.',
  },
  Playlist: numbered('play list', 'playListId', 'A play list lasts until the next one.'),
  PlayItem: numbered('play item', 'playItemId', 'A play item lasts until the next one.'),
  ChapterNumber: counted('chapter', 'chapter'),
  VideoInfo: counted('video', 'number'),
  AudioInfo: counted('audio', 'number'),
  PresentationGraphicsInfo: counted('subtitles', 'number'),
  AngleInfo: counted('angle', 'number'),
  InteractiveGraphicsInfo: counted('interactive graphics', 'number'),
  SecondaryVideoInfo: counted('secondary video', 'number'),
  SecondaryAudioInfo: counted('secondary audio', 'number'),
  PipPgTextStInfo: counted('picture-in-picture subtitles', 'number'),
  InteractiveGraphicsVisible: { on: 'menu', begins: always('Visible'), because: 'A menu is on the screen.' },
  InteractiveGraphicsInvisible: { on: 'menu', because: 'The menu has left the screen.' },
};

/**
 * The tracks on which an effect begins or ends slices when its name is `name`.
 * @param {Effect} effect
 * @param {string | null} name
 * @returns {string[]}
 */
export function tracksOf(effect, name) {
  if (effect.on) {
    return [effect.on];
  }
  return name === null ? PlaybackTracks : ['playback'];
}
