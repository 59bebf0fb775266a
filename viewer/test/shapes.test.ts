import assert from "node:assert/strict";
import { test } from "node:test";
import { Vector3 } from "three";
import { type Block, type Datum, type Header, Model } from "../src/data";
import { axesAt, turnedAxes } from "../src/frames";
import { Cells, piecesOf, sampled } from "../src/shapes";

function block(cell: string, corners: number, nodes: number, first: number, count: number, connectivity: number): Block {
    return { role: "solid", cell, corners, nodes, type: "X", first, count, connectivity, labels: 0 };
}

/** Two squares side by side, and a line. */
function cells(): Cells {
    const floats = new Float32Array([0, 0, 0, 1, 0, 0, 2, 0, 0, 0, 1, 0, 1, 1, 0, 2, 1, 0]);
    const bytes = new Uint8Array(floats.length * 4 + 12);
    bytes.set(new Uint8Array(floats.buffer));
    bytes.set([0, 1, 4, 3, 1, 2, 5, 4, 0, 5], floats.length * 4);
    const header = {
        format: "qrx-page/1",
        arrays: [
            { type: "f32", offset: 0, length: 18 },
            { type: "u8", offset: 72, length: 8 },
            { type: "u8", offset: 80, length: 2 },
        ],
        meshes: [{ positions: 0, blocks: [block("quad4", 4, 4, 0, 2, 1), block("line2", 2, 2, 2, 1, 2)] }],
    } as unknown as Header;
    return new Cells(new Model(header, bytes), 0);
}

test("cells are found by their numbers", () => {
    const mesh = cells();
    assert.deepEqual(mesh.nodesOf(1), [1, 2, 5, 4]);
    assert.deepEqual(mesh.nodesOf(2), [0, 5]);
    assert.deepEqual(mesh.centreOf(1), [1.5, 0.5, 0]);
    assert.deepEqual(mesh.directionOf(0), [0, 0, 1]);
    assert.deepEqual(mesh.directionOf(2).map((x) => Number(x.toFixed(6))), [0.894427, 0.447214, 0]);
});

test("pieces know the cell that they are of", () => {
    const mesh = cells();
    assert.deepEqual(mesh.pieces([0, 1, 2], 2), { index: [0, 1, 4, 0, 4, 3, 1, 2, 5, 1, 5, 4], cellOf: [0, 0, 1, 1] });
    assert.deepEqual(mesh.pieces([0, 1, 2], 1), { index: [0, 5], cellOf: [2] });
});

test("an edge of two faces is drawn once", () => {
    assert.equal(cells().elementEdges().length, 2 * 7);
});

test("the triangles of every face cover it once, all turning as its corners do", () => {
    const corners: Record<string, [number, number][]> = {
        triangle3: [[0, 0], [2, 0], [0, 2]],
        triangle6: [[0, 0], [2, 0], [0, 2], [1, 0], [1, 1], [0, 1]],
        quad4: [[0, 0], [2, 0], [2, 2], [0, 2]],
        quad8: [[0, 0], [2, 0], [2, 2], [0, 2], [1, 0], [2, 1], [1, 2], [0, 1]],
        quad9: [[0, 0], [2, 0], [2, 2], [0, 2], [1, 0], [2, 1], [1, 2], [0, 1], [1, 1]],
    };
    for (const [cell, places] of Object.entries(corners)) {
        const pieces = piecesOf(block(cell, 0, 0, 0, 0, 0));
        let area = 0;
        for (let i = 0; i < pieces.length; i += 3) {
            const [a, b, c] = [0, 1, 2].map((k) => places[pieces[i + k] ?? -1] ?? [NaN, NaN]) as [[number, number], [number, number], [number, number]];
            const twice = (b[0] - a[0]) * (c[1] - a[1]) - (b[1] - a[1]) * (c[0] - a[0]);
            assert.ok(twice > 0, cell);
            area += twice / 2;
        }
        assert.equal(area, cell.startsWith("triangle") ? 2 : 4, cell);
    }
});

test("a sample is spread evenly and no larger than asked", () => {
    assert.deepEqual(sampled([1, 2, 3], 5), [1, 2, 3]);
    assert.deepEqual(sampled([0, 1, 2, 3, 4, 5, 6, 7], 4), [1, 3, 5, 7]);
});

test("a cylinder's directions are radius, tangent and axis", () => {
    const datum: Datum = { name: "", type: "CSYS", system: "CYLINDRICAL", origin: [1, 0, 0], axes: [[1, 0, 0], [0, 1, 0], [0, 0, 1]] };
    const [radius, tangent, axis] = axesAt(datum, new Vector3(1, 5, 7));
    assert.deepEqual(radius.toArray(), [0, 1, 0]);
    assert.deepEqual(tangent.toArray(), [-1, 0, 0]);
    assert.deepEqual(axis.toArray(), [0, 0, 1]);
});

test("axes turn about one of them by degrees", () => {
    const datum: Datum = { name: "", type: "CSYS", system: "RECTANGULAR", origin: [0, 0, 0], axes: [[1, 0, 0], [0, 1, 0], [0, 0, 1]] };
    const [, second] = turnedAxes(axesAt(datum, new Vector3()), 0, 90);
    assert.ok(second.distanceTo(new Vector3(0, 0, 1)) < 1e-12);
});
