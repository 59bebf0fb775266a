// Opens every page of the built manual at a telephone's width and a desk's: nothing may be wider than the window, and
// nothing may be asked of a network.
//
//   node widths.mjs SITE [PICTURES]   (with a folder: pictures of the pages too)
import { existsSync, mkdirSync, readdirSync, writeFileSync } from "node:fs";
import { join, relative } from "node:path";
import { pathToFileURL } from "node:url";
import { Chromium } from "../../viewer/test/chromium.mjs";

const WIDTHS = [[390, 844], [1400, 900]];
// What sticks out, and isn't in a box that scrolls by itself.
const STICKING_OUT = `(() => {
    const wide = document.documentElement.scrollWidth - document.documentElement.clientWidth;
    if (wide <= 0) return "";
    const scrolls = (node) => node && (["auto", "scroll", "hidden"].includes(getComputedStyle(node).overflowX) || scrolls(node.parentElement));
    const out = [...document.querySelectorAll("article *")].filter((node) => node.getBoundingClientRect().right > innerWidth + 1 && !scrolls(node.parentElement));
    return wide + " px: " + out.slice(0, 3).map((node) => node.tagName + " " + node.textContent.trim().slice(0, 60)).join("; ");
})()`;
const READY = "document.readyState === 'complete' && location.href !== 'about:blank'";

const [site, pictures] = process.argv.slice(2);
if (!existsSync(join(site, "index.html"))) {
    console.log("skipped: there is no manual here");
    process.exit(3);
}
const pages = readdirSync(site, { recursive: true, withFileTypes: true })
    .filter((entry) => entry.isFile() && entry.name.endsWith(".html"))
    .map((entry) => join(entry.parentPath ?? entry.path, entry.name))
    .sort();
if (pictures !== undefined) mkdirSync(pictures, { recursive: true });
const browser = await Chromium.start();
let wrong = 0;
try {
    for (const [width, height] of WIDTHS) {
        const tab = await browser.newPage(width, height);
        for (const page of pages) {
            tab.said = [];
            tab.requests = [];
            await tab.send("Page.navigate", { url: pathToFileURL(page).href });
            await tab.until(READY);
            const outside = tab.requests.filter((url) => !url.startsWith("file:") && !url.startsWith("data:"));
            const found = [await tab.value(STICKING_OUT), ...outside, ...tab.said].filter((text) => text !== "");
            if (found.length > 0) {
                console.log(`${relative(site, page)} at ${width}: ${found.join("; ")}`);
                ++wrong;
            }
            if (pictures !== undefined) {
                const name = relative(site, page).replaceAll("/", "_").replace(".html", `-${width}.png`);
                writeFileSync(join(pictures, name), await tab.picture());
            }
        }
    }
} finally {
    await browser.stop();
}
console.log(`${pages.length} pages at ${WIDTHS.map(([width]) => width).join(" and ")} px, ${wrong} wrong`);
process.exitCode = wrong > 0 || pages.length === 0 ? 1 : 0;
