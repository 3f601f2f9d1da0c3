/** The SPDX document of the page: which packages of npm it contains, in which versions. */

import { Buffer } from 'node:buffer';
import { execFileSync } from 'node:child_process';
import { createHash } from 'node:crypto';
import { readFile } from 'node:fs/promises';
import { fileURLToPath } from 'node:url';

const folder = fileURLToPath(new URL('..', import.meta.url));

/** @param {string} file */
const jsonOf = async (file) => JSON.parse(await readFile(`${folder}${file}`, 'utf8'));

/** SOURCE_DATE_EPOCH, or else the time of the last commit to the page, so that the same sources give the same text. */
function sourceTime() {
  const given = process.env.SOURCE_DATE_EPOCH;
  if (given) {
    return Number(given);
  }
  try {
    const options = { encoding: 'utf8', stdio: ['ignore', 'pipe', 'ignore'] };
    return Number(execFileSync('git', ['-C', folder, 'log', '-1', '--format=%ct', '--', '.'], options));
  } catch {
    return 0; // sources without their history
  }
}

/** @param {string} name */
const idOf = (name) => `SPDXRef-${name.replace('@', '').replace(/[^A-Za-z0-9.]+/g, '-')}`;

/**
 * @param {string} name
 * @param {string} version
 * @param {object} rest
 */
const describe = (name, version, rest) => ({
  SPDXID: idOf(name),
  name,
  versionInfo: version,
  ...rest,
  supplier: 'NOASSERTION',
  downloadLocation: 'NOASSERTION',
  filesAnalyzed: false,
  licenseConcluded: 'NOASSERTION',
  licenseDeclared: 'NOASSERTION',
  copyrightText: 'NOASSERTION',
});

/**
 * @param {string} name
 * @param {{version: string, integrity: string}} locked
 * @param {string} primaryPackagePurpose
 */
function describeLocked(name, locked, primaryPackagePurpose) {
  const [algorithm, value] = locked.integrity.split('-');
  return describe(name, locked.version, {
    primaryPackagePurpose,
    checksums: [
      { algorithm: algorithm.toUpperCase(), checksumValue: Buffer.from(value, 'base64').toString('hex') },
    ],
    externalRefs: [
      {
        referenceCategory: 'PACKAGE-MANAGER',
        referenceType: 'purl',
        referenceLocator: `pkg:npm/${name.replace('@', '%40')}@${locked.version}`,
      },
    ],
  });
}

/**
 * @param {Iterable<string>} inputs the files that a bundler put into the page, relative to the page's folder
 * @returns {Promise<string>}
 */
export async function sbomOf(inputs) {
  const page = await jsonOf('package.json');
  const locked = (await jsonOf('package-lock.json')).packages;
  const names = new Set();
  for (const input of inputs) {
    const match = /.*\bnode_modules\/((?:@[^/]+\/)?[^/]+)\//.exec(input);
    if (match && !input.startsWith(`node_modules/${match[1]}/`)) {
      throw new Error(`${input}: two versions of a package`);
    }
    if (match) {
      names.add(match[1]);
    }
  }
  const contained = [...names].sort();
  const bundler = 'esbuild';

  /** @type {{spdxElementId: string, relationshipType: string, relatedSpdxElement: string}[]} */
  const relationships = [];
  const relate = (/** @type {string} */ from, /** @type {string} */ type, /** @type {string} */ to) =>
    relationships.push({ spdxElementId: idOf(from), relationshipType: type, relatedSpdxElement: idOf(to) });
  relate('DOCUMENT', 'DESCRIBES', page.name);
  relate(bundler, 'BUILD_TOOL_OF', page.name);
  for (const name of contained) {
    relate(page.name, 'CONTAINS', name);
    const { dependencies, peerDependencies } = locked[`node_modules/${name}`];
    Object.keys({ ...dependencies, ...peerDependencies })
      .filter((needed) => names.has(needed))
      .forEach((needed) => relate(name, 'DEPENDS_ON', needed));
  }

  const packages = [
    describe(page.name, page.version, { primaryPackagePurpose: 'APPLICATION', packageFileName: 'timeline.html' }),
    ...contained.map((name) => describeLocked(name, locked[`node_modules/${name}`], 'LIBRARY')),
    describeLocked(bundler, locked[`node_modules/${bundler}`], 'APPLICATION'),
  ];
  const created = new Date(sourceTime() * 1000).toISOString().replace('.000', '');
  const hash = createHash('sha256').update(JSON.stringify([packages, relationships, created])).digest('hex');
  const sbom = {
    spdxVersion: 'SPDX-2.3',
    dataLicense: 'CC0-1.0',
    SPDXID: idOf('DOCUMENT'),
    name: `${page.name}-${page.version}`,
    documentNamespace: `https://spdx.org/spdxdocs/${page.name}-${page.version}-${hash}`,
    creationInfo: { created, creators: [`Tool: ${page.name}-${page.version}`] },
    packages,
    relationships,
  };
  return `${JSON.stringify(sbom, null, 2)}\n`;
}
