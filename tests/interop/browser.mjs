// Opens a page in Chromium, without a display and without a network, and has it measure files. Its one argument is a
// JSON file: the browser, the folder of packages, the page's module, and the jobs.
import { readFileSync, writeFileSync } from 'node:fs';
import path from 'node:path';
import { chromium } from 'playwright-core';

const run = JSON.parse(readFileSync(process.argv[2], 'utf8'));
const SITE = 'http://interop.invalid';
const PAGE = `<!doctype html>
<script type="importmap">
{ "imports": { "three": "/packages/three/build/three.module.js", "three/addons/": "/packages/three/examples/jsm/" } }
</script>`;

// What the page asks for is read from the disk; there is nothing else.
function answer(url) {
  const { origin, pathname } = new URL(url);
  if (origin !== SITE) return undefined;
  if (pathname === '/') return { body: PAGE, contentType: 'text/html' };
  if (pathname === '/measure.mjs') return { path: run.page, contentType: 'text/javascript' };
  const [, kind, ...rest] = decodeURIComponent(pathname).split('/');
  if (kind === 'packages') return { path: path.join(run.packages, ...rest), contentType: 'text/javascript' };
  if (kind === 'files') return { path: run.jobs[Number(rest[0])].file, contentType: 'application/octet-stream' };
  return undefined;
}

const browser = await chromium.launch({ executablePath: run.chromium });
try {
  const page = await browser.newPage();
  page.on('pageerror', (error) => console.error(error.stack));
  await page.route('**/*', (route) => {
    const answered = answer(route.request().url());
    return answered ? route.fulfill(answered) : route.abort();
  });
  await page.goto(`${SITE}/`);
  for (const [number, job] of run.jobs.entries()) {
    const asked = { url: `/files/${number}`, usd: job.file.endsWith('.usda'), frames: job.frames };
    const measured = await page.evaluate(async (one) => {
      const { measure } = await import('/measure.mjs');
      return JSON.stringify(await measure(one));
    }, asked);
    writeFileSync(job.output, measured);
  }
} finally {
  await browser.close();
}
