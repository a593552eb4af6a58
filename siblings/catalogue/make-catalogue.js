// Turns the package's city list into the catalogue: the largest cities with
// a time zone, one per line, tab-separated, largest first. Also writes the
// licence note that ships beside it.
// usage: node make-catalogue.js <package dir> <count> <out tsv> <out licence>
'use strict';
const fs = require('fs');
const path = require('path');

const [packageDir, countText, outTsv, outLicence] = process.argv.slice(2);
const count = parseInt(countText, 10);
const manifest = JSON.parse(fs.readFileSync(path.join(packageDir, 'package.json'), 'utf8'));
const cities = JSON.parse(fs.readFileSync(path.join(packageDir, 'data', 'cityMap.json'), 'utf8'));

// Tabs and line ends would break the line format; nothing else is touched.
const clean = (text) => String(text || '').replace(/[\t\r\n]+/g, ' ').trim();
const slug = (text) => clean(text).normalize('NFD').replace(/[\u0300-\u036f]/g, '').toLowerCase().replace(/[^a-z0-9]+/g, '-').replace(/^-|-$/g, '');

const usable = cities.filter((c) => c.timezone && c.city && c.city_ascii && c.iso2 &&
  Number.isFinite(c.lat) && Number.isFinite(c.lng) && Math.abs(c.lat) <= 90 && Math.abs(c.lng) <= 180);
usable.sort((a, b) => (b.pop - a.pop) || a.city_ascii.localeCompare(b.city_ascii));
const chosen = usable.slice(0, count);
if (chosen.length < Math.min(count, 1000)) {
  console.error(`make-catalogue: only ${chosen.length} usable cities in ${packageDir}`);
  process.exit(1);
}

const taken = new Set();
const lines = chosen.map((c) => {
  // A readable id that stays the same for the pinned package; a second city
  // of the same name in one country gets its province added.
  let id = `${slug(c.iso2)}-${slug(c.city_ascii)}`;
  if (taken.has(id)) id = `${id}-${slug(c.province) || 'x'}`;
  let n = 2;
  const base = id;
  while (taken.has(id)) id = `${base}-${n++}`;
  taken.add(id);
  return [id, clean(c.city), clean(c.city_ascii), clean(c.country), clean(c.iso2).toUpperCase(),
    clean(c.province), c.lat.toFixed(5), c.lng.toFixed(5), clean(c.timezone), Math.round(c.pop)].join('\t');
});

const header = '# id\tname\tname_en\tcountry\tiso2\tprovince\tlatitude\tlongitude\ttime_zone\tpopulation';
fs.writeFileSync(outTsv, [header, ...lines].join('\n') + '\n');
fs.writeFileSync(outLicence, [
  `City catalogue of the weather suite's stand-ins: the ${chosen.length} largest cities of the`,
  `npm package ${manifest.name} ${manifest.version} by ${manifest.author || 'its authors'}`,
  `(${manifest.homepage || ''}), licence: ${manifest.license}.`,
  'Its city list is the basic world cities list of simplemaps.com (drawn from Natural',
  'Earth populated places). The package ships no licence file; its package.json',
  `names the ${manifest.license} licence, whose standard text follows.`,
  '',
  `${manifest.license} License`,
  '',
  `Copyright (c) ${manifest.author || 'the authors of ' + manifest.name}`,
  '',
  'Permission is hereby granted, free of charge, to any person obtaining a copy',
  'of this software and associated documentation files (the "Software"), to deal',
  'in the Software without restriction, including without limitation the rights',
  'to use, copy, modify, merge, publish, distribute, sublicense, and/or sell',
  'copies of the Software, and to permit persons to whom the Software is',
  'furnished to do so, subject to the following conditions:',
  '',
  'The above copyright notice and this permission notice shall be included in all',
  'copies or substantial portions of the Software.',
  '',
  'THE SOFTWARE IS PROVIDED "AS IS", WITHOUT WARRANTY OF ANY KIND, EXPRESS OR',
  'IMPLIED, INCLUDING BUT NOT LIMITED TO THE WARRANTIES OF MERCHANTABILITY,',
  'FITNESS FOR A PARTICULAR PURPOSE AND NONINFRINGEMENT. IN NO EVENT SHALL THE',
  'AUTHORS OR COPYRIGHT HOLDERS BE LIABLE FOR ANY CLAIM, DAMAGES OR OTHER',
  'LIABILITY, WHETHER IN AN ACTION OF CONTRACT, TORT OR OTHERWISE, ARISING FROM,',
  'OUT OF OR IN CONNECTION WITH THE SOFTWARE OR THE USE OR OTHER DEALINGS IN THE',
  'SOFTWARE.',
  ''].join('\n'));
