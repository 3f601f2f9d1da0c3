// Puts the questions of examples/fleet to a folder of recordings.
//
//   const answers = await answer('recordings');
//   answers['losses.sql'] // an array of rows: objects by the names of columns
//
// node answers.mjs FOLDER prints them.

import { readFileSync } from 'node:fs';
import path from 'node:path';
import { fileURLToPath } from 'node:url';
import { DuckDBInstance } from '@duckdb/node-api';

const queries = fileURLToPath(new URL('../../examples/fleet/', import.meta.url));

/** In the order of docs/fleet.md. */
export const questions = [
  'slow-listeners.sql',
  'before-play-failed.sql',
  'skipping-forbidden.sql',
  'resumes.sql',
  'losses.sql',
];

const readQuery = (name) => readFileSync(path.join(queries, name), 'utf8');

/** A connection with the table "records" of all recordings in a folder and those below. */
export async function readRecords(folder) {
  const connection = await (await DuckDBInstance.create(':memory:')).connect();
  const pattern = path.join(folder, '**', '*.jsonl').replaceAll("'", "''");
  await connection.run(`SET VARIABLE recordings = '${pattern}'`);
  await connection.run(readQuery('records.sql'));
  return connection;
}

/** The rows of a query; whole numbers and decimal ones are numbers. */
export async function rowsOf(connection, sql) {
  const rows = (await connection.runAndReadAll(sql)).getRowObjects();
  for (const row of rows) {
    for (const [name, value] of Object.entries(row)) {
      if (typeof value === 'bigint' || typeof value?.toDouble === 'function') {
        row[name] = Number(value.toString());
      }
    }
  }
  return rows;
}

/** The rows of every answer, by the name of its query. */
export async function answer(folder) {
  const connection = await readRecords(folder);
  const answers = {};
  for (const question of questions) {
    answers[question] = await rowsOf(connection, readQuery(question));
  }
  connection.closeSync();
  return answers;
}

/** A table as Markdown; values that are null are empty. */
export function tableOf(rows) {
  const line = (cells) => `| ${cells.join(' | ')} |\n`;
  const names = Object.keys(rows[0] ?? { 'no rows': null });
  return line(names) + line(names.map(() => '---')).replaceAll(' ', '') +
    rows.map((row) => line(Object.values(row).map((value) => value ?? ''))).join('');
}

if (process.argv[1] === fileURLToPath(import.meta.url)) {
  if (process.argv.length !== 3) {
    console.error('usage: node answers.mjs FOLDER');
    process.exit(2);
  }
  for (const [question, rows] of Object.entries(await answer(process.argv[2]))) {
    console.log(`${readQuery(question).split('\n')[0].replace('-- ', '')}\n\n${tableOf(rows)}`);
  }
}
