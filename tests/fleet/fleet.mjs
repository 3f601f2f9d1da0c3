// A fleet of players with known faults: makes the logs of some evenings on each, and converts them.
//
//   const seeded = makeFleet({ player, disc, folder });
//
// The callbacks are those of sessions of the desk player. Their logs are changed as players in the
// field would have written them: with the time of day, listeners that take time, pauses, and losses.
// The same numbers come out on every run.

import { spawnSync } from 'node:child_process';
import { mkdirSync, readdirSync, writeFileSync } from 'node:fs';
import path from 'node:path';

export const Devices = 30;
export const LogsPerDevice = 10;
const Firmwares = ['1.0', '1.1', '2.0'];

/** What a viewer does, and which of it fails. */
const Sessions = {
  film: `play
at 2s pause
after 1s continue
at 00:30 pip on
at 00:40 forward fast 1
after 5s forward
at 01:00 suspend
after 1s resume
at 01:30 stop
`,
  failure: `play
at 00:10 standby
after 1s wake without data
fail play
play
after 5s play
after 5s stop
after 20s play
after 1s stop
`,
  recovery: `play
at 00:10 standby
after 1s wake without data
after 5s play
after 5s stop
`,
  firstFailure: `fail play
play
after 5s play
after 5s stop
`,
  trailer: `play
after 2s suspend
after 1s resume
after 1s stop
`,
  brokenTrailer: `play
after 2s suspend
fail resume
after 1s resume
`,
  standby: `play
at 00:10 standby
after 1s wake
after 5s stop
`,
};

/** The play lists that the sessions play. */
export const PlayLists = {
  film: 1, failure: 1, recovery: 1, firstFailure: 1, standby: 1, trailer: 2, brokenTrailer: 2,
};

/**
 * How many seconds the sessions play the studio's logo, the first six seconds of play list 1, in
 * which skipping is forbidden. The first time ends when the film begins, if it is not the last.
 */
const Forbidden = {
  film: [7], failure: [6, 5, 1], recovery: [6, 5], firstFailure: [5], standby: [6], trailer: [],
  brokenTrailer: [],
};

/** Numbers from 0 to below a limit that look random. */
function numbers(seed) {
  let state = seed;
  return (limit) => {
    state = (Math.imul(state, 1103515245) + 12345) >>> 0;
    return Math.floor((state / 2 ** 32) * limit);
  };
}

/** Runs a program that must succeed. */
function run(program, args) {
  const result = spawnSync(program, args, { encoding: 'utf8', maxBuffer: 2 ** 28 });
  if (result.status !== 0) {
    throw new Error(`${program} ${args.join(' ')}: ${result.stderr}`);
  }
  return result;
}

/** The lines that a session's player writes: { microseconds, text }. */
function linesOf(player, disc, folder, name) {
  const session = path.join(folder, `${name}.session`);
  writeFileSync(session, Sessions[name]);
  const { stderr } = run(player, [
    disc, '--playlist', String(PlayLists[name]), '--session', session,
    '--log', 'BdmvNavigator=Event', '--output', path.join(folder, `${name}.txt`),
  ]);
  return stderr.trimEnd().split('\n').map((line) => {
    const [, hours, minutes, seconds, fraction, text] =
      /^(\d+):(\d\d):(\d\d)\.(\d{6}) (.*)$/.exec(line);
    const whole = (Number(hours) * 60 + Number(minutes)) * 60 + Number(seconds);
    return { microseconds: whole * 1e6 + Number(fraction), text };
  });
}

/** Whether a line is not the first of its event: the listeners have returned from a callback. */
const followsListeners = ({ text }) =>
  / Event: (Send (un)?available|For (normal|speed) play) /.test(text);

/** The callback that a line announces, if others of its event may follow. */
function callbackBefore(text) {
  const [, sending] = /Event: Sending (\w+)/.exec(text) ?? [];
  return sending ?? `PictureInPicture${text.includes(' unavailable') ? 'Una' : 'A'}vailable`;
}

/** Shifts all lines from an index on. */
function delay(lines, index, microseconds) {
  for (let i = index; i < lines.length; ++i) {
    lines[i].microseconds += microseconds;
  }
}

function timeOfDay(microseconds) {
  const start = Date.UTC(2024, 4, 31, 20, 15);
  const date = new Date(start + Math.floor(microseconds / 1000)).toISOString();
  const rest = String(microseconds % 1000).padStart(3, '0');
  return `${date.slice(0, 10)} ${date.slice(11, 23)}${rest}`;
}

/** Adds faults to a device's log, and what they are to the seeds. @return the log */
function seedFaults(name, original, device, random, seeds) {
  const lines = original.map((line) => ({ ...line }));

  // The listeners of one firmware are slow.
  const isSlow = device.firmware === '2.0';
  const permitted = lines.findIndex(({ text }) => text.includes('uoMask: 0'));
  let waitsWhileForbidden = 0;
  lines.forEach((line, i) => {
    if (followsListeners(line)) {
      const wait = isSlow ? 150 + random(100) : 2 + random(3); // milliseconds
      delay(lines, i, wait * 1000);
      waitsWhileForbidden += i < permitted ? wait / 1000 : 0;
      (seeds.waits[`${device.firmware} ${callbackBefore(lines[i - 1].text)}`] ??= []).push(wait);
    }
  });

  // Viewers pause while skipping is forbidden.
  let pause = 0;
  if (name === 'film') {
    pause = random(60);
    delay(lines, lines.findIndex(({ text }) => text.includes('Sending Continued')), pause * 1e6);
  }
  const [first, ...others] = Forbidden[name];
  if (first !== undefined) {
    seeds.forbidden.push(first + pause + waitsWhileForbidden, ...others);
  }

  const losesLines = name === 'trailer' && device.name === 'D07';
  seeds.evenings.push({ session: name, ...device, losesLines });

  const text = lines.map((line) => `${timeOfDay(line.microseconds)} ${line.text}\n`);
  if (losesLines) {
    // The device's log cannot keep up.
    const lost = 2 + random(3);
    const last = text.length - 2;
    const time = text[last].slice(0, 26);
    text.splice(last - lost, lost, `${time} Common Warning: lines lost: ${lost}\n`);
    seeds.lost.push(lost);
  } else if (name === 'standby' && device.index < 3) {
    // Its power is cut while it writes.
    text.push(text.pop().slice(0, -5));
    seeds.truncated.push(device.name);
  }
  return `kernel: a foreign line\n${text.join('')}`;
}

/** The sessions of a device's evenings. */
function evenings(device, random) {
  const names = [];
  for (let i = 0; i < LogsPerDevice; ++i) {
    const trailer = device.firmware === '1.1' && random(10) < 4 ? 'brokenTrailer' : 'trailer';
    names.push(
      ['film', trailer, 'film', 'failure', 'standby', trailer, 'film',
        random(10) < 2 ? 'recovery' : 'failure',
        device.index % 10 === 0 ? 'firstFailure' : 'film', trailer][i]);
  }
  return names;
}

/**
 * Makes the logs of a fleet, and their recordings below folder/recordings.
 *
 * @return what the answers must find
 */
export function makeFleet({ player, disc, folder }) {
  const base = Object.fromEntries(
    Object.keys(Sessions).map((name) => [name, linesOf(player, disc, folder, name)]));
  const random = numbers(20240531);
  const seeds = { waits: {}, forbidden: [], evenings: [], lost: [], truncated: [] };
  for (let index = 0; index < Devices; ++index) {
    const device = {
      index,
      name: `D${String(index).padStart(2, '0')}`,
      firmware: Firmwares[Math.floor((index * Firmwares.length) / Devices)],
    };
    const logs = path.join(folder, 'logs', device.name);
    mkdirSync(logs, { recursive: true });
    evenings(device, random).forEach((name, evening) => {
      const log = seedFaults(name, base[name], device, random, seeds);
      writeFileSync(path.join(logs, `evening-${evening}.log`), log);
    });
    run(player, [
      '--field-log', ...readdirSync(logs).sort().map((log) => path.join(logs, log)),
      '--format', 'json', '--jobs', '2',
      '--tag', `device=${device.name}`, '--tag', `firmware=${device.firmware}`,
      '--output-folder', path.join(folder, 'recordings', device.name),
    ]);
  }
  return seeds;
}
