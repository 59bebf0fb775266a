// Pictures of the examples: what acts must be seen where the models say that it acts, and look as it did.
import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { existsSync, mkdirSync, readFileSync, writeFileSync } from "node:fs";
import { tmpdir } from "node:os";
import { join } from "node:path";
import { acting, mostMarks, sizes } from "./acting.mjs";
import { Camera, cross, Deck, dot, plus, unit } from "./deck.mjs";
import { difference, readPng } from "./png.mjs";

const [width, height] = [620, 480];
/** A square of 8 x 8 pixels may differ by so much of 255 in its mean colour from how it looked. */
const tolerance = 4;
/** By so much of 255 a pixel changes that a mark covers, however faint. */
const least = 5;
const colours = { loads: [209, 16, 90], boundaryConditions: [224, 122, 0] };

/** The picture alone, without texts, whose fonts differ from machine to machine. */
export async function showPictureAlone(tab) {
    await tab.resize(1100, 620);
    await tab.value(`document.getElementById('app').style.gridTemplate = '"stage" ${height}px / ${width}px';
        for (const id of ['bar', 'left', 'right', 'time']) document.getElementById(id).style.display = 'none';
        const overlay = document.getElementById('overlay'); if (overlay) overlay.style.display = 'none';
        dispatchEvent(new Event('resize'))`);
    await tab.frame();
    await tab.value("document.getElementById('fit').click()");
    await tab.frame();
}

/** What the canvas shows, as a PNG. */
async function pngOf(tab) {
    const url = await tab.value("(qrxPage.stage.drawNow(), qrxPage.stage.canvas.toDataURL('image/png'))");
    return Buffer.from(url.split(",")[1], "base64");
}

const pictureOf = async (tab) => readPng(await pngOf(tab));

/** The pixels that differ between two pictures. */
class Change {
    constructor(now, before) {
        assert.deepEqual([now.width, now.height], [width, height]);
        Object.assign(this, { now, before, differs: new Uint8Array(width * height) });
        for (let i = 0; i < 3 * width * height; ++i) if (Math.abs(now.rgb[i] - before.rgb[i]) >= least) this.differs[Math.floor(i / 3)] = 1;
    }

    pixel(x, y) {
        const place = 3 * (Math.round(y) * width + Math.round(x));
        return { now: [...this.now.rgb.subarray(place, place + 3)], before: [...this.before.rgb.subarray(place, place + 3)] };
    }

    is(x, y) {
        return x >= 0 && y >= 0 && x < width && y < height && this.differs[y * width + x] === 1;
    }

    /** Whether a pixel there, or next to it, is another one. */
    near(x, y) {
        const [left, top] = [Math.round(x) - 1, Math.round(y) - 1];
        for (let i = 0; i < 9; ++i) if (this.is(left + (i % 3), top + Math.floor(i / 3))) return true;
        return false;
    }

    *all() {
        for (let place = 0; place < this.differs.length; ++place) if (this.differs[place] === 1) yield { x: place % width, y: Math.floor(place / width) };
    }

    /** Whether a pixel changed towards a colour, in more or less light, or as far as one can see through it. */
    isTowards(x, y, colour) {
        const { now, before } = this.pixel(x, y);
        const step = plus(now, before, -1);
        for (let light = 0.2; light < 1.4; light += 0.05) {
            const aim = plus(colour.map((value) => light * value), before, -1);
            const part = dot(step, aim) / Math.max(dot(aim, aim), 1);
            if (part > 0.08 && part < 1.15 && Math.hypot(...plus(step, aim, -part)) < 0.3 * Math.hypot(...step)) return true;
        }
        return false;
    }
}

/** Marks that must be there: each from a place in a direction, of a length. */
function marksOf(object, deck, size) {
    const along = (places, direction, length) => places.map((from) => ({ from, direction, length: length * size }));
    const kind = object.name.split("/")[0];
    if (object.nodes) return along(deck.nodes(object.nodes), object.along, kind === "loads" ? sizes.force : sizes.motion);
    if (object.held) {
        return deck.nodes(object.held).flatMap((place) => object.freedoms.map((freedom) => {
            const axis = [0, 1, 2].map((i) => (i === (freedom - 1) % 3 ? 1 : 0));
            // A cone ends at its node; a bar has its node in its middle.
            if (freedom <= 3) return { from: plus(place, axis, -sizes.cone * size), direction: axis, length: sizes.cone * size };
            return { from: plus(place, axis, -sizes.bar * size * 0.4), direction: axis, length: sizes.bar * size * 0.8 };
        }));
    }
    if (object.faces) {
        const length = sizes.pressure * size;
        return deck.faces(object.faces).map(({ centre, out }) => ({ from: plus(centre, out, length), direction: out.map((x) => -x), length }));
    }
    if (object.bolt) {
        const faces = deck.faces(object.bolt);
        const length = sizes.bolt * size;
        return [1, -1].map((sign) => {
            const out = faces[0].out.map((x) => sign * x);
            return { from: plus(faces[0].centre, out, length), direction: out.map((x) => -x), length };
        });
    }
    return [];
}

/** Whether a mark is seen along nearly all of its length. */
function isSeen(mark, change, camera) {
    let seen = 0;
    const samples = 8;
    for (let i = 0; i < samples; ++i) {
        const { x, y } = camera.at(plus(mark.from, mark.direction, mark.length * (0.15 + (0.75 * i) / (samples - 1))));
        seen += change.near(x, y);
    }
    return seen >= samples - 1;
}

/** The pixels that lie near some places. */
function discs(spots, reach) {
    const inside = new Uint8Array(width * height);
    for (const spot of spots) {
        for (let y = Math.max(0, Math.ceil(spot.y - reach)); y < Math.min(height, spot.y + reach); ++y)
            for (let x = Math.max(0, Math.ceil(spot.x - reach)); x < Math.min(width, spot.x + reach); ++x) if ((x - spot.x) ** 2 + (y - spot.y) ** 2 < reach ** 2) inside[y * width + x] = 1;
    }
    return inside;
}

function checkMarks(object, deck, size, change, camera, what) {
    const marks = marksOf(object, deck, size);
    const wanted = Math.min(marks.length, mostMarks);
    const seen = marks.filter((mark) => isSeen(mark, change, camera)).length;
    assert.ok(seen >= Math.ceil(0.95 * wanted), `${what}: ${seen} of ${wanted} marks are seen`);
    // And nothing elsewhere: each changed pixel lies near one of them.
    const spots = marks.flatMap((mark) => [0, 0.25, 0.5, 0.75, 1].map((part) => camera.at(plus(mark.from, mark.direction, part * mark.length))));
    const around = discs(spots, 18);
    let [changed, looked, towards] = [0, 0, 0];
    for (const { x, y } of change.all()) {
        assert.ok(around[y * width + x] === 1, `${what}: something at ${x}, ${y}`);
        if (++changed % 3 !== 0) continue;
        ++looked;
        towards += change.isTowards(x, y, colours[object.name.split("/")[0]]);
    }
    assert.ok(looked > 0 && towards > 0.7 * looked, `${what}: ${towards} of ${looked} pixels have its colour`);
}

/** The page's camera so that a direction goes from left to right; shows all. */
async function lookAcross(tab, direction) {
    const centre = await tab.value("qrxPage.stage.box.getCenter(qrxPage.stage.camera.position.clone()).toArray()");
    const size = await tab.value("qrxPage.stage.size");
    const up = unit(cross(direction, Math.abs(direction[2]) < 0.9 ? [0, 0, 1] : [1, 0, 0]));
    const eye = plus(centre, cross(up, direction), -2 * size);
    await tab.value(`qrxPage.stage.view = ${JSON.stringify([...eye, ...centre, ...up, (0.55 * size) / Math.tan(Math.PI / 9)])}`);
}

/**
 * Seen from the side, arrows begin and end where they should, with the tip at the end that points. Where many stand one
 * behind the other it is the tips that leave gaps between them.
 */
async function checkHeads(tab, object, deck, size, takeChange, what) {
    const marks = marksOf(object, deck, size);
    const direction = object.along ?? marks[0].direction;
    await lookAcross(tab, direction);
    const { change, camera } = await takeChange();
    const columns = new Map();
    for (const { x } of change.all()) columns.set(x, (columns.get(x) ?? 0) + 1);
    const perPixel = size / (camera.at(plus(camera.target, direction, size)).x - camera.at(camera.target).x);
    const offset = (x) => (x - width / 2) * perPixel;
    const left = Math.min(...columns.keys());
    const along = (place) => dot(plus(place, camera.target, -1), direction);
    const begin = marks.length > 0 ? Math.min(...marks.filter((mark) => dot(mark.direction, direction) > 0).map((mark) => along(mark.from))) : offset(left);
    const length = marks[0]?.length ?? sizes.gravity * size;
    const end = marks.length > 0 ? Math.max(...marks.map((mark) => along(mark.from))) + (object.bolt ? 0 : length) : begin + length;
    const counts = { tail: 0, shaft: 0, head: 0, tip: 0 };
    const spans = { tail: [0.01, 0.07], shaft: [0.2, 0.32], head: [0.68, 0.8], tip: [0.93, 0.99] };
    for (const [x, count] of columns) {
        const place = offset(x);
        assert.ok(place > begin - 4 * perPixel && place < end + 4 * perPixel, `${what}: from the side, something ${place} along, expected ${begin} to ${end}`);
        // Of a bolt's arrows the second one points the other way.
        const part = object.bolt && place > begin + length ? (end - place) / length : (place - begin) / length;
        for (const [name, [from, to]] of Object.entries(spans)) if (part >= from && part <= to) counts[name] += count;
    }
    assert.ok(counts.head >= counts.shaft && counts.tail > 1.1 * counts.tip, `${what}: ${JSON.stringify(counts)}`);
}

/** What has no arrows is seen on its regions and nowhere else. */
function checkRegions(object, deck, change, camera, what) {
    const boxes = object.on.map((region) => {
        const seen = deck.places(region).map((place) => camera.at(place));
        return { left: Math.min(...seen.map(({ x }) => x)), right: Math.max(...seen.map(({ x }) => x)), top: Math.min(...seen.map(({ y }) => y)), bottom: Math.max(...seen.map(({ y }) => y)) };
    });
    const margin = 12;
    const all = { left: Math.min(...boxes.map((b) => b.left)), right: Math.max(...boxes.map((b) => b.right)), top: Math.min(...boxes.map((b) => b.top)), bottom: Math.max(...boxes.map((b) => b.bottom)) };
    const counts = boxes.map(() => 0);
    const within = (box, { x, y }) => x >= box.left - margin && x <= box.right + margin && y >= box.top - margin && y <= box.bottom + margin;
    for (const pixel of change.all()) {
        assert.ok(within(all, pixel), `${what}: something at ${pixel.x}, ${pixel.y}`);
        boxes.forEach((box, i) => (counts[i] += within(box, pixel)));
    }
    counts.forEach((count, i) => assert.ok(count > 20, `${what}: ${object.on[i]} shows ${count} pixels`));
}

class Shooting {
    constructor(tab, example, deck) {
        Object.assign(this, { tab, example, deck, marks: 0 });
    }

    async prepare() {
        this.names = await this.tab.value("qrxPage.model.header.objects.map((object) => `${object.kind}/${object.name}`)");
        this.size = await this.tab.value("qrxPage.stage?.size ?? 1");
    }

    async camera() {
        return new Camera(await this.tab.value("qrxPage.stage.view"), width, height);
    }

    /** Shows the arrows, cones and bars of one object alone, or of none; all but the last one where one is to be missing. */
    async only(index, less = 0) {
        await this.tab.value(`for (const drawn of qrxPage.marks.group.children) for (const part of drawn.children) if (part.isInstancedMesh) {
            part.visible = drawn.userData.object === ${index};
            part.count = part.instanceMatrix.count - ${less};
        }`);
        return pictureOf(this.tab);
    }

    async change(index, before) {
        const none = before ?? (await this.only(-1));
        return { change: new Change(await this.only(index), none), camera: await this.camera() };
    }

    async checkRegions(step, object, now, what) {
        await this.tab.value(`qrxPage.marks.show(${step}, ${this.names.indexOf(object.name)})`);
        const change = new Change(now, await pictureOf(this.tab));
        await this.tab.value(`qrxPage.marks.show(${step})`);
        checkRegions(object, this.deck, change, await this.camera(), what);
    }

    /** Each arrow, cone or bar stands where it should; one arrow less is seen as well as a picture that differs. */
    async checkMarks(object, none, what) {
        const index = this.names.indexOf(object.name);
        const { change, camera } = await this.change(index, none);
        assert.ok(difference(change.now, none).most > tolerance, `${what}: can go unseen`);
        if (!object.everywhere) checkMarks(object, this.deck, this.size, change, camera, what);
        if (object.held) return;
        const less = difference(await this.only(index, 1), change.now).most;
        assert.ok(less > tolerance, `${what}: one arrow can go unseen (${less})`);
        const view = await this.tab.value("qrxPage.stage.view");
        await checkHeads(this.tab, object, this.deck, this.size, () => this.change(index), what);
        await this.tab.value(`qrxPage.stage.view = ${JSON.stringify(view)}`);
    }

    /** Looks for what should be seen in a step, of which `now` is the picture. */
    async check(step, objects, now) {
        const whatOf = (object) => `${this.example}, step ${acting[this.example].steps[step]}, ${object.name}`;
        for (const object of objects) if (object.on) await this.checkRegions(step, object, now, whatOf(object));
        const marked = objects.filter((object) => !object.on);
        const none = marked.length > 0 ? await this.only(-1) : undefined;
        for (const object of marked) await this.checkMarks(object, none, whatOf(object));
        await this.tab.value(`qrxPage.marks.show(${step})`);
        await this.tab.frame();
        this.marks += objects.length;
    }
}

/** Every example in every step; gives how many marks were looked for. */
export async function checkPictures(tab, { pageOf, program, project, folder, pictures, rewrite }) {
    let marks = 0;
    if (rewrite) mkdirSync(pictures, { recursive: true });
    for (const [example, { steps, objects }] of Object.entries(acting)) {
        await tab.open(pageOf(example));
        assert.deepEqual(await tab.value("qrxPage.model.header.steps.map((step) => step.name)"), steps, example);
        if (steps.length === 0) continue;
        await showPictureAlone(tab);
        execFileSync(program, ["write", join(project, "examples", example, `${example}.json`), "--output-dir", folder], { stdio: "ignore" });
        const shooting = new Shooting(tab, example, new Deck(readFileSync(join(folder, `${example}.inp`), "utf8")));
        await shooting.prepare();
        const seen = new Set();
        for (const [step, name] of steps.entries()) {
            await tab.value(`qrxPage.goToStep(${step})`);
            await tab.frame();
            const png = await pngOf(tab);
            const now = readPng(png);
            const expected = objects.filter((object) => object.in === undefined || object.in.split(" ").includes(name));
            const drawn = await tab.value("qrxPage.marks.group.children.map((child) => { const o = qrxPage.model.header.objects[child.userData.object]; return `${o.kind}/${o.name}`; })");
            assert.deepEqual(drawn.sort(), expected.map((object) => object.name).sort(), `${example}, step ${name}`);
            await shooting.check(step, expected.filter((object) => !seen.has(object)), now);
            for (const object of expected) seen.add(object);
            const file = join(pictures, `${example}-${step}-${name}.png`);
            if (rewrite) writeFileSync(file, png);
            assert.ok(existsSync(file), `${file} is missing; scripts/make-pictures.sh makes it`);
            const worst = difference(now, readPng(readFileSync(file)));
            if (worst.most > tolerance) writeFileSync(join(tmpdir(), `differs-${example}-${step}.png`), png);
            assert.ok(worst.most <= tolerance, `${example}, step ${name}, against ${file}: ${JSON.stringify(worst)}`);
        }
        assert.equal(seen.size, objects.length, example);
        marks += shooting.marks;
    }
    return marks;
}
