import assert from "node:assert/strict";
import { test } from "node:test";
import { bytesOfBase64, type Header, Model, type ModelObject } from "../src/data";

const status = (words: string, active: boolean) => ({ name: words.toUpperCase(), words, active });

function object(steps: [number, number, number][], more: Partial<ModelObject> = {}): ModelObject {
    return {
        kind: "loads", name: "Push", class: "", label: "", doc: "", mark: "force", suppressed: false,
        fields: [], regions: [], states: [], cards: [[{ loadCase: "", text: "*Cload\n" }], [{ loadCase: "", text: "*Cload, op=NEW\n" }]],
        steps, ...more,
    };
}

function model(part: Partial<Header>, bytes = new Uint8Array(0)): Model {
    return new Model(
        {
            format: "qrx-page/1", title: "", description: "", arrays: [], meshes: [], instances: [], sets: [], sections: [],
            statuses: [status("not yet active", false), status("created", true), status("propagated", true), status("deactivated", false)],
            steps: [], datums: [], objects: [], ...part,
        },
        bytes,
    );
}

test("base64 of the standard's examples", () => {
    for (const [text, bytes] of [["", ""], ["Zg==", "f"], ["Zm8=", "fo"], ["Zm9v", "foo"], ["Zm9vYmFy", "foobar"]] as const) {
        assert.equal(String.fromCharCode(...bytesOfBase64(text)), bytes);
    }
});

test("arrays have the type, place and length that the header says", () => {
    const bytes = new Uint8Array(16);
    new DataView(bytes.buffer).setFloat32(4, 1.5, true);
    new DataView(bytes.buffer).setInt16(8, -3, true);
    bytes[0] = 200;
    const data = model({ arrays: [{ type: "u8", offset: 0, length: 1 }, { type: "f32", offset: 4, length: 1 }, { type: "i16", offset: 8, length: 2 }] }, bytes);
    assert.deepEqual([...data.numbers(0)], [200]);
    assert.deepEqual([...data.numbers(1)], [1.5]);
    assert.deepEqual([...data.numbers(2)], [-3, 0]);
    assert.throws(() => data.numbers(3), RangeError);
});

test("runs are first and length", () => {
    const data = model({ arrays: [{ type: "u8", offset: 0, length: 4 }] }, new Uint8Array([4, 3, 9, 1]));
    assert.deepEqual(data.unrolled(0), [4, 5, 6, 9]);
    assert.deepEqual(data.unrolled(undefined), []);
});

test("data of another form is refused", () => {
    assert.throws(() => model({ format: "qrx-page/2" }), /can't show data of the form qrx-page\/2/);
});

test("an object is active by its status, a constraint always, a suppressed one never", () => {
    const data = model({});
    const load = object([[0, -1, -1], [1, 0, 0], [2, 0, -1], [3, 0, 1]]);
    assert.deepEqual([0, 1, 2, 3].map((step) => data.isActive(load, step)), [false, true, true, false]);
    assert.equal(data.statusWords(load, 3), "deactivated");
    assert.ok(data.isActive(object([[-1, -1, 0]]), 0));
    assert.equal(data.statusWords(object([[-1, -1, 0]]), 0), "holds in all steps");
    assert.ok(!data.isActive(object([[1, 0, 0]], { suppressed: true }), 0));
});

test("a step that only carries an object on shows the lines of the last step that wrote it", () => {
    const data = model({});
    const load = object([[0, -1, -1], [1, 0, 0], [2, 0, -1], [2, 0, 1]]);
    assert.equal(data.cardOf(load, 0), undefined);
    assert.deepEqual(data.cardOf(load, 2), { card: load.cards[0], step: 1 });
    assert.deepEqual(data.cardOf(load, 3), { card: load.cards[1], step: 3 });
});

test("lines from before an object ended are not shown behind its end", () => {
    const data = model({});
    const load = object([[1, 0, 0], [3, 0, 1], [0, -1, -1]]);
    assert.equal(data.cardOf(load, 1)?.step, 1);
    assert.equal(data.cardOf(object([[1, 0, 0], [3, 0, -1], [0, -1, -1]]), 2), undefined);
});
