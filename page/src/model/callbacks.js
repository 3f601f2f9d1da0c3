/**
 * The arguments of every callback in their order, by interface. A recording may lack some of them; the page then
 * says so. A test compares this with docs/outputs.md.
 * @type {Readonly<Record<string, Readonly<Record<string, readonly string[]>>>>}
 */
export const Interfaces = {
  control: {
    PlayStarted: [],
    FirstPictureDelivered: [],
    PlayFailed: [],
    Paused: [],
    Continued: ['direction', 'speed'],
    Stepped: ['position', 'direction'],
    TriggerTimeReached: ['type', 'time'],
    TriggerSet: ['type', 'result'],
    ZoomModeSet: ['clip', 'destination', 'delay'],
    Stopped: [],
    Finished: ['reason'],
    StillOn: [],
    StillOff: [],
    Suspended: [],
    Resumed: [],
    ResumeFailed: [],
    SystemSuspended: ['data', 'size'],
    SystemResumed: ['playing'],
    SystemResumeFailed: [],
    JumpOccurred: [],
    PreloadFailed: [],
  },
  settings: {
    Playlist: ['playListId'],
    PlayItem: ['playListId', 'playItemId', 'videoFormat', 'aspectRatio'],
    PlayMode: ['direction', 'speed'],
    AudioInfo: ['number'],
    VideoInfo: ['number'],
    AngleInfo: ['number'],
    InteractiveGraphicsInfo: ['number'],
    PresentationGraphicsInfo: ['number', 'available'],
    SecondaryAudioInfo: ['number'],
    SecondaryVideoInfo: ['number'],
    PipPgTextStInfo: ['number', 'available'],
    AudioInfoChanged: ['isPrimary', 'format', 'sampleRate', 'bitsPerSample', 'channels', 'pid', 'channelLayout'],
    TextSubtitleStyleInfo: ['styleNumber'],
    TextSubtitleStylesAvailable: ['numberOfStyles'],
    UOMask: ['forbidden'],
    ChapterNumber: ['chapter'],
    MarkInfo: ['playListId', 'markId', 'time'],
    CurrentTimePosition: ['position'],
    PictureInPictureAvailable: [],
    PictureInPictureUnavailable: [],
    SecondaryAudioAvailable: [],
    SecondaryAudioUnavailable: [],
    PresentationGraphicsDisplay: ['shown'],
    SecondaryVideoDisplay: ['number', 'shown'],
    SecondaryAudioDisplay: ['number', 'shown'],
    PipPgTextSelect: ['pick'],
  },
  button: {
    ExecuteButton: ['ticket', 'buttonId', 'commands'],
  },
  interactive: {
    InteractiveGraphicsVisible: [],
    InteractiveGraphicsInvisible: [],
    PopUpMenuAvailable: [],
    PopUpMenuUnavailable: [],
    ButtonActivationBusy: [],
    ButtonActivationDone: [],
    InteractiveGraphicsActive: [],
    InteractiveGraphicsInactive: [],
  },
};

/** Arguments that are positions: ticks from the start of the play list, or null for none. */
const Positions = new Set([
  'Stepped.position', 'TriggerTimeReached.time', 'MarkInfo.time', 'CurrentTimePosition.position',
]);

/** @type {Map<string, readonly string[]>} */
const ArgumentsByCallback = new Map(Object.values(Interfaces).flatMap((callbacks) => Object.entries(callbacks)));

/**
 * @param {string} callback
 * @returns {readonly string[]} empty for a callback that this page does not know
 */
export function argumentsOf(callback) {
  return ArgumentsByCallback.get(callback) ?? [];
}

/**
 * @param {string} callback
 * @param {string} argument
 */
export function isPosition(callback, argument) {
  return Positions.has(`${callback}.${argument}`);
}
