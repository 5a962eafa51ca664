// Tells a group of stories in a browser, and which of them did not go as they should: node tell.mjs BROWSER STORIES BUILD
import {launch, removeFolders} from './browser.mjs';

const {default: stories, leave} = await import(`./${process.argv[3]}.mjs`);
const only = process.argv[5];
const browser = await launch();
let failed = 0;
for (const [name, story] of Object.entries(stories)) {
  if (only && !name.includes(only)) continue;
  const start = Date.now();
  try {
    await story(browser);
    console.log(`ok (${((Date.now() - start) / 1000).toFixed(1)} s): ${name}`);
  } catch (error) {
    ++failed;
    const place = /(\w+\.mjs:\d+)/g;
    console.log(`FAILED: ${name}\n  ${error.message}\n  ${(error.stack ?? '').match(place)?.slice(0, 4).join(', ') ?? ''}`);
  }
}
await browser.close();
await leave();
removeFolders();
process.exit(failed === 0 ? 0 : 1); // whatever a story that failed has left running
