// Takes a picture of a page: node picture.mjs PAGE.html[#fragment] PICTURE.png [WIDTHxHEIGHT] [expression]
import { writeFileSync } from "node:fs";
import { pathToFileURL } from "node:url";
import { Chromium } from "./test/chromium.mjs";

const [page, picture, size = "1280x800", expression] = process.argv.slice(2);
const [file, fragment] = page.split("#");
const [width, height] = size.split("x").map(Number);
const browser = await Chromium.start();
try {
    const tab = await browser.newPage(width, height);
    const time = await tab.open(pathToFileURL(file).href + (fragment === undefined ? "" : "#" + fragment));
    if (expression !== undefined) await tab.value(expression);
    await tab.frame();
    writeFileSync(picture, await tab.picture());
    console.log(`${picture}: drawn ${Math.round(time)} ms after it was asked for${tab.said.length > 0 ? "; the page said: " + tab.said.join("; ") : ""}`);
} finally {
    await browser.stop();
}
