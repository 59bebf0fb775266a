// How long pages take to their first picture, in turn: node first_picture.mjs ROUNDS PAGE.html... A line a page as JSON:
// milliseconds from asking for it to its first picture, as a picture of the window has it, and the script's own memory.
import { pathToFileURL } from "node:url";
import { Chromium } from "./test/chromium.mjs";

const [rounds, ...pages] = process.argv.slice(2);
const browser = await Chromium.start();
const results = pages.map((page) => ({ page, picture: [], heap: [] }));
try {
    for (let round = 0; round < Number(rounds); ++round) {
        for (const result of results) {
            const tab = await browser.newPage(1280, 800);
            const begin = performance.now();
            await tab.open(pathToFileURL(result.page).href, 5);
            await tab.picture();
            result.picture.push(Math.round(performance.now() - begin));
            const { metrics } = await tab.send("Performance.getMetrics");
            result.heap.push(metrics.find((metric) => metric.name === "JSHeapUsedSize")?.value ?? 0);
            await tab.close();
        }
    }
} finally {
    await browser.stop();
}
for (const result of results) console.log(JSON.stringify(result));
