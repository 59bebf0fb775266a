// The page in a real browser, opened from disk: node browser.mjs QRXDECK PROJECT [--pictures] [[--but] TEST]
// With --pictures the expected pictures are made anew, to be looked at.
import assert from "node:assert/strict";
import { execFileSync, spawnSync } from "node:child_process";
import { existsSync, mkdtempSync, readFileSync, rmSync, writeFileSync } from "node:fs";
import { tmpdir } from "node:os";
import { dirname, join } from "node:path";
import { fileURLToPath, pathToFileURL } from "node:url";
import { acting } from "./acting.mjs";
import { Chromium } from "./chromium.mjs";
import { checkPictures } from "./pictures.mjs";
import { colours, difference, readPng } from "./png.mjs";

const [program, project, ...options] = process.argv.slice(2);
const pictures = join(dirname(fileURLToPath(import.meta.url)), "pictures");
const rewrite = options.includes("--pictures");
const only = options.find((option) => !option.startsWith("--"));
const folder = mkdtempSync(join(tmpdir(), "qrx_browser_"));

function qrxdeck(...words) {
    return spawnSync(program, words, { cwd: folder, encoding: "utf8" });
}

function pageOf(name) {
    const file = join(folder, `${name}.html`);
    if (!existsSync(file)) execFileSync(program, ["view", join(project, "examples", name, `${name}.json`), "-o", file]);
    return pathToFileURL(file).href;
}

function pageOfModel(name, members) {
    const model = join(folder, `${name}.json`);
    writeFileSync(model, JSON.stringify({ format: "qrx-model/1", models: { "Default Model": members } }));
    const run = qrxdeck("view", model);
    assert.equal(run.status, 0, run.stderr);
    return pathToFileURL(join(folder, `${name}.html`)).href;
}

const cubes = (n) => {
    const m = n + 1;
    const coordinates = [];
    for (let k = 0; k < m; ++k) for (let j = 0; j < m; ++j) for (let i = 0; i < m; ++i) coordinates.push([i, j, k]);
    const connectivity = [];
    const at = (i, j, k) => 1 + i + m * (j + m * k);
    for (let k = 0; k < n; ++k) for (let j = 0; j < n; ++j) for (let i = 0; i < n; ++i)
        connectivity.push([at(i, j, k), at(i + 1, j, k), at(i + 1, j + 1, k), at(i, j + 1, k), at(i, j, k + 1), at(i + 1, j, k + 1), at(i + 1, j + 1, k + 1), at(i, j + 1, k + 1)]);
    return { nodes: { labels: { from: 1, to: m ** 3 }, coordinates }, elements: [{ type: "C3D8", labels: { from: 1, to: n ** 3 }, connectivity }] };
};

const steps = [{ name: "Initial", class: "kprC_InitialStep" }, { name: "Push", class: "kprC_StaticStep" }, { name: "Pull", class: "kprC_StaticStep" }];

const tests = {
    async "every example opens without a word on the console or a request to anywhere"(tab) {
        for (const name of Object.keys(acting)) {
            const url = pageOf(name);
            await tab.open(url);
            const count = await tab.value("qrxPage.model.header.steps.length");
            for (let step = 0; step < count; ++step) await tab.value(`qrxPage.goToStep(${step})`);
            await tab.frame();
            assert.deepEqual(tab.said, [], name);
            const elsewhere = tab.requests.filter((request) => request !== url && !request.startsWith("data:") && !request.startsWith("blob:"));
            assert.deepEqual(elsewhere, [], name);
            const picture = readPng(await tab.picture("#canvas"));
            if (count > 0) assert.ok(colours(picture) > 12, `${name} is nearly blank`);
        }
    },

    async "the pictures of all examples show in each step what acts, where and which way, and look as they did"(tab) {
        const marks = await checkPictures(tab, { pageOf, program, project, folder, pictures, rewrite });
        assert.ok(marks >= 40, `${marks} marks were looked for`);
    },

    async "picking finds the instance under the pointer, and its element"(tab) {
        const two = { parts: { P: { mesh: cubes(2) } }, assembly: { instances: { Left: { part: "P" }, Right: { part: "P", translation: [6, 0, 0] } } } };
        await tab.open(pageOfModel("two", two));
        await tab.value("document.querySelector('[aria-label=\"Look from −y\"]').click()");
        await tab.frame();
        const box = await tab.value("(() => { const r = document.getElementById('canvas').getBoundingClientRect(); return [r.x, r.y, r.width, r.height]; })()");
        const pick = async (part) => {
            await tab.click(box[0] + box[2] * part, box[1] + box[3] * 0.5);
            return tab.value("qrxPage.selection && [qrxPage.model.instance(qrxPage.selection.index).name, qrxPage.selection.hit.type, qrxPage.selection.hit.side]");
        };
        assert.deepEqual(await pick(0.25), ["Left", "C3D8", 3]);
        assert.deepEqual(await pick(0.75), ["Right", "C3D8", 3]);
        assert.equal((await pick(0.5)) ?? null, null);
    },

    async "the bar of steps changes what is drawn and what the lists say"(tab) {
        const model = {
            parts: { P: { mesh: { ...cubes(2), sets: [{ name: "TOP", kind: "surface", facets: [5, 6, 7, 8].map((e) => [e, "S2"]) }] } } },
            assembly: { instances: { I: { part: "P" } } }, steps,
            loads: { Weight: { class: "kloC_Pressure", region: "I.TOP", states: { Push: { magnitude: 3 }, Pull: { deactivated: true } } } },
        };
        await tab.open(pageOfModel("steps", model));
        const red = async () => {
            const { rgb } = readPng(await tab.picture("#canvas"));
            let count = 0;
            for (let i = 0; i < rgb.length; i += 3) if (rgb[i] > rgb[i + 1] + 60 && rgb[i] > rgb[i + 2] + 30) ++count;
            return count;
        };
        const press = async (name) => {
            await tab.value(`[...document.querySelectorAll('#steps button')].find((b) => b.firstChild.textContent === ${JSON.stringify(name)}).click()`);
            await tab.frame();
            return tab.value("document.querySelector('[data-select=\"loads/Weight\"]').textContent");
        };
        assert.match(await press("Initial"), /not yet active$/);
        const before = await red();
        assert.match(await press("Push"), /created · 3$/);
        const during = await red();
        assert.match(await press("Pull"), /deactivated$/);
        const after = await red();
        assert.ok(during > before + 200 && during > after + 200, `${before} ${during} ${after}`);
        assert.equal(await tab.value("document.querySelector('#steps [aria-current]').firstChild.textContent"), "Pull");
    },

    async "the lines of steps and loads on the page are those of the deck, in every step that writes them"(tab) {
        for (const name of ["thermo_mechanical", "bolted_joint", "bracket"]) {
            execFileSync(program, ["write", join(project, "examples", name, `${name}.json`), "--output-dir", folder]);
            const deck = readFileSync(join(folder, `${name}.inp`), "utf8");
            await tab.open(pageOf(name));
            const shown = await tab.value(`(() => { const all = []; const { model } = qrxPage;
                model.header.steps.forEach((step, i) => { qrxPage.goToStep(i);
                    if (i > 0) all.push([step.name, 'the step', document.querySelector('#happening > pre').textContent]);
                    model.header.objects.forEach((object, k) => { if (object.steps[i][2] < 0 || object.kind !== 'loads') return;
                        qrxPage.select({ kind: 'object', index: k }, false);
                        for (const pre of document.querySelectorAll('#card pre')) all.push([step.name, object.name, pre.textContent]); }); });
                return all; })()`);
            assert.ok(shown.length > 0);
            for (const [step, load, text] of shown) {
                const begin = deck.indexOf(`** STEP: ${step}\n`);
                const end = deck.indexOf("*End Step", begin);
                // A bolt has lines among the boundary conditions and lines among the loads.
                const lines = deck.slice(begin, end).split("\n");
                let from = 0;
                for (const line of text.replace(/\n$/, "").split("\n")) {
                    const found = lines.indexOf(line, from);
                    assert.ok(begin >= 0 && found >= 0, `${name}, ${step}, ${load}:\n${text}`);
                    from = found + 1;
                }
            }
        }
    },

    async "names with markup in them stay text"(tab) {
        const bad = "</script><img src=x onerror=broken=1>";
        const model = {
            description: bad, parts: { [bad]: { mesh: { ...cubes(1), sets: [{ name: bad, kind: "node", labels: [1, 2] }, { name: "E", kind: "element", labels: [1] }] },
                sectionAssignments: [{ region: "E", sectionName: bad }] } },
            assembly: { name: bad, instances: { [bad]: { part: bad } }, sets: [{ name: bad, kind: "node", members: [{ instance: bad, labels: [1] }] }] },
            materials: { [bad]: {} }, sections: { [bad]: { class: "kseC_HomogenousSolidSection", materialName: bad } }, datums: [{ name: bad }],
            steps: [{ name: "Initial", class: "kprC_InitialStep" }, { name: bad, class: "kprC_StaticStep", description: bad }],
            loads: { [bad]: { class: "kloC_ConcentratedForce", region: bad, states: { [bad]: { component1: 1 } } } },
            boundaryConditions: { [bad]: { class: "kbcC_TypeBC", region: bad, states: { Initial: { typeName: "PINNED" } } } },
            fields: { [bad]: { class: "kpfC_Temperature", region: bad, states: { Initial: { values: [1] } } } },
            constraints: { [bad]: { class: "kcoC_Equation", terms: [{ coefficient: 1, setName: bad, dof: 1 }, { coefficient: 1, setName: bad, dof: 2 }] } },
        };
        await tab.open(pageOfModel("markup", model));
        await tab.value("document.getElementById('colour').value = 'material', document.getElementById('colour').dispatchEvent(new Event('change'))");
        const count = await tab.value("qrxPage.model.header.objects.length");
        assert.equal(count, 4);
        for (let i = 0; i < count; ++i) await tab.value(`qrxPage.select({ kind: 'object', index: ${i} })`);
        await tab.value("qrxPage.select({ kind: 'set', region: { instance: 0, set: 0 } })");
        await tab.frame();
        assert.deepEqual(tab.said, []);
        assert.equal(await tab.value("document.images.length"), 0);
        assert.equal(await tab.value("document.scripts.length"), 3);
        assert.equal(await tab.value("typeof broken"), "undefined");
        for (const place of ["#steps", "#sets", "#instances", "#legend", "#facts", "#happening"]) {
            assert.ok((await tab.value(`document.querySelector('${place}').textContent`)).includes(bad), place);
        }
    },

    async "a model without a mesh gets a page that says so; unknown elements are counted"(tab) {
        await tab.open(pageOfModel("nothing", { steps }));
        assert.match(await tab.value("document.getElementById('note').textContent"), /has no mesh/);
        assert.equal(await tab.value("document.getElementById('note').hidden"), false);
        const odd = { parts: { P: { mesh: { nodes: { labels: [1, 2], coordinates: [[0, 0, 0], [1, 0, 0]] }, elements: [{ type: "XYZ2", labels: [1, 2], connectivity: [[1, 2], [2, 1]] }] } } },
            assembly: { instances: { I: { part: "P" } } } };
        await tab.open(pageOfModel("odd", odd));
        assert.match(await tab.value("document.getElementById('facts').textContent"), /2 elements of type XYZ2, drawn as points/);
        assert.deepEqual(tab.said, []);
    },

    async "a model with errors gets its messages and no page"() {
        const model = join(folder, "wrong.json");
        writeFileSync(model, JSON.stringify({ format: "qrx-model/1", models: { "Default Model": { loads: { P: { class: "kloC_Pressure", region: "none" } } } } }));
        const run = qrxdeck("view", model);
        assert.equal(run.status, 1);
        assert.match(run.stderr, /error/);
        assert.ok(!existsSync(join(folder, "wrong.html")));
    },

    async "an address shows the same picture again"(tab) {
        const url = pageOf("thermo_mechanical");
        await tab.open(url);
        await tab.value("qrxPage.goToStep(3), qrxPage.select({ kind: 'object', index: qrxPage.model.header.objects.findIndex((o) => o.kind === 'loads') }, false)");
        await tab.value("document.querySelector('[aria-label=\"Look from +x\"]').click(), document.getElementById('projection').click()");
        await tab.value("qrxPage.setCut({ axis: 'y', part: 0.5, flipped: true }), qrxPage.setColour('material')");
        await tab.until("location.hash.includes('cut=') && location.hash.includes('select=') && location.hash.split('view=')[1].split('%2C').length === 10");
        await new Promise((done) => setTimeout(done, 300));
        const fragment = await tab.value("location.hash");
        const first = readPng(await tab.picture());
        await tab.open(url + fragment);
        await new Promise((done) => setTimeout(done, 300));
        assert.ok(difference(readPng(await tab.picture()), first).most < 4);
        assert.equal(await tab.value("location.hash"), fragment);
        assert.deepEqual(tab.said, []);
    },

    async "a set is found by its name, lights up and comes near; internal ones hide at first"(tab) {
        const model = {
            parts: { P: { mesh: { ...cubes(6), sets: [{ name: "CORNER", kind: "element", labels: [1] }, { name: "_hidden", internal: true, kind: "element", labels: [2] }, { name: "OTHER", kind: "node", labels: [5] }] } } },
            assembly: { instances: { I: { part: "P" } } },
        };
        await tab.open(pageOfModel("sets", model));
        const visible = () => tab.value("[...document.querySelectorAll('#sets li')].filter((li) => !li.hidden).map((li) => li.dataset.name)");
        assert.deepEqual(await visible(), ["i.corner", "i.other"]);
        await tab.value("document.getElementById('search').value = 'corn', document.getElementById('search').dispatchEvent(new Event('input'))");
        assert.deepEqual(await visible(), ["i.corner"]);
        const yellow = async () => {
            const { rgb } = readPng(await tab.picture("#canvas"));
            let count = 0;
            for (let i = 0; i < rgb.length; i += 3) if (rgb[i] > 140 && rgb[i + 1] > 90 && rgb[i + 2] < 60) ++count;
            return count;
        };
        assert.equal(await yellow(), 0);
        await tab.value("document.querySelector('#sets li:not([hidden]) button').click()");
        await tab.frame();
        assert.ok((await yellow()) > 5000);
        await tab.value("document.getElementById('search').value = '', document.getElementById('internal').click()");
        assert.deepEqual(await visible(), ["i.corner", "i._hidden", "i.other"]);
    },

    async "every control has a name, and the keyboard reaches all of them and turns the model"(tab) {
        await tab.open(pageOf("bracket"));
        const { nodes } = await tab.send("Accessibility.getFullAXTree");
        const controls = nodes.filter((node) => !node.ignored && ["button", "checkbox", "combobox", "slider", "searchbox", "textbox", "link", "application"].includes(node.role?.value));
        assert.ok(controls.length > 20);
        assert.deepEqual(controls.filter((node) => !node.name?.value), []);
        const seen = new Set();
        for (let i = 0; i < 120 && !seen.has("picture canvas steps"); ++i) {
            await tab.press("Tab");
            const at = await tab.value("document.activeElement.id || document.activeElement.closest('[id]')?.id");
            seen.add(at);
            if (["picture", "canvas", "steps"].every((id) => seen.has(id))) seen.add("picture canvas steps");
        }
        for (const id of ["fit", "views", "projection", "cut-axis", "picture", "search", "colour", "sets", "canvas", "happening", "steps"]) assert.ok(seen.has(id), id);
        await tab.value("document.getElementById('canvas').focus()");
        const before = readPng(await tab.picture("#canvas"));
        await tab.press("ArrowLeft");
        assert.ok(difference(readPng(await tab.picture("#canvas")), before).most > 20);
        const step = await tab.value("qrxPage.step");
        await tab.press(".");
        assert.equal(await tab.value("qrxPage.step"), step + 1);
        await tab.press("3");
        const [x, y] = await tab.value("qrxPage.stage.view.slice(0, 3).map((e, i) => e - qrxPage.stage.view[3 + i])");
        assert.ok(y > 100 * Math.abs(x), "key 3 looks from +y");
    },

    async "light and dark follow the system; at 200 % and on narrow windows nothing is cut off"(tab) {
        const url = pageOf("bolted_joint");
        const dark = async (value) => {
            await tab.send("Emulation.setEmulatedMedia", { features: [{ name: "prefers-color-scheme", value }] });
            await tab.open(url);
            return tab.value("getComputedStyle(document.body).backgroundColor");
        };
        const [light, night] = [await dark("light"), await dark("dark")];
        assert.notEqual(light, night);
        await tab.send("Emulation.setEmulatedMedia", { features: [] });
        // A window of 1200 pixels at 200 %.
        await tab.resize(600, 400);
        await tab.open(url);
        assert.ok(await tab.value("document.documentElement.scrollWidth <= innerWidth"));
        assert.ok(await tab.value("document.getElementById('canvas').clientWidth > 500"));
        await tab.resize(1200, 800);
    },

    async "shells show two colours, one a side"(tab) {
        const shell = { parts: { P: { mesh: { nodes: { labels: [1, 2, 3, 4], coordinates: [[0, 0, 0], [1, 0, 0], [1, 1, 0], [0, 1, 0]] }, elements: [{ type: "S4R", labels: [1], connectivity: [[1, 2, 3, 4]] }] } } },
            assembly: { instances: { I: { part: "P" } } } };
        await tab.open(pageOfModel("shell", shell));
        const middle = async (view) => {
            await tab.value(`document.querySelector('[aria-label="Look from ${view}"]').click()`);
            await tab.frame();
            const { rgb, width, height } = readPng(await tab.picture("#canvas"));
            const place = 3 * (Math.floor(height / 2) * width + Math.floor(width / 2));
            return [...rgb.slice(place, place + 3)];
        };
        const [above, below] = [await middle("+z"), await middle("−z")];
        assert.ok(above[2] > above[0] && below[0] > below[2] + 30, `${above} ${below}`);
    },
};

const browser = await Chromium.start();
let failed = 0;
const begin = performance.now();
try {
    for (const [name, test] of Object.entries(tests)) {
        if (only !== undefined && name.includes(only) === options.includes("--but")) continue;
        const tab = await browser.newPage();
        const start = performance.now();
        try {
            const note = await test(tab);
            console.log(`ok      ${note === undefined ? "" : note + " - "}${name} (${Math.round(performance.now() - start)} ms)`);
        } catch (error) {
            ++failed;
            console.log(`FAILED  ${name}\n${error.stack}`);
        }
        await tab.close();
    }
} finally {
    await browser.stop();
    rmSync(folder, { recursive: true, force: true });
}
console.log(`${Math.round((performance.now() - begin) / 1000)} s, ${failed} failed`);
process.exit(failed === 0 ? 0 : 1);
