// How cells become triangles and lines, and where they are.
import { at, type Block, type Model, type Numbers } from "./data";

const triangles: Record<string, number[]> = {
    triangle3: [0, 1, 2],
    triangle6: [0, 3, 5, 3, 1, 4, 5, 4, 2, 3, 4, 5],
    quad4: [0, 1, 2, 0, 2, 3],
    quad8: [0, 4, 7, 4, 1, 5, 5, 2, 6, 6, 3, 7, 4, 5, 6, 4, 6, 7],
    quad9: [0, 4, 8, 0, 8, 7, 4, 1, 5, 4, 5, 8, 8, 5, 2, 8, 2, 6, 7, 8, 6, 7, 6, 3],
};
const lines: Record<string, number[]> = {
    line2: [0, 1],
    line3: [0, 2, 2, 1],
    triangle3: [0, 1, 1, 2, 2, 0],
    triangle6: [0, 3, 3, 1, 1, 4, 4, 2, 2, 5, 5, 0],
    quad4: [0, 1, 1, 2, 2, 3, 3, 0],
    quad8: [0, 4, 4, 1, 1, 5, 5, 2, 2, 6, 6, 3, 3, 7, 7, 0],
    quad9: [0, 4, 4, 1, 1, 5, 5, 2, 2, 6, 6, 3, 3, 7, 7, 0],
};

export type Dimension = 0 | 1 | 2;

export function dimensionOf(block: Block): Dimension {
    if (block.cell in triangles) return 2;
    return block.cell in lines ? 1 : 0;
}

/** The cell's pieces of its own dimension, as places in its row of nodes. */
export function piecesOf(block: Block): readonly number[] {
    return triangles[block.cell] ?? lines[block.cell] ?? [0];
}

export function edgesOf(block: Block): readonly number[] {
    return lines[block.cell] ?? [];
}

/** One mesh's cells, found by their numbers. */
export class Cells {
    readonly positions: Float32Array;
    readonly blocks: Block[];
    private readonly rows: Numbers[];

    constructor(
        readonly model: Model,
        mesh: number,
    ) {
        const text = at(model.header.meshes, mesh);
        this.positions = model.numbers(text.positions) as Float32Array;
        this.blocks = text.blocks;
        this.rows = text.blocks.map((block) => model.numbers(block.connectivity));
    }

    blockOf(cell: number): number {
        let low = 0;
        let high = this.blocks.length - 1;
        while (low < high) {
            const middle = (low + high + 1) >> 1;
            if (at(this.blocks, middle).first <= cell) low = middle;
            else high = middle - 1;
        }
        return low;
    }

    row(block: number): Numbers {
        return at(this.rows, block);
    }

    nodesOf(cell: number): number[] {
        const index = this.blockOf(cell);
        const block = at(this.blocks, index);
        const begin = (cell - block.first) * block.nodes;
        return Array.from(this.row(index).slice(begin, begin + block.nodes));
    }

    cornersOf(cell: number): number[] {
        return this.nodesOf(cell).slice(0, at(this.blocks, this.blockOf(cell)).corners);
    }

    place(node: number): [number, number, number] {
        return [at(this.positions, 3 * node), at(this.positions, 3 * node + 1), at(this.positions, 3 * node + 2)];
    }

    centreOf(cell: number): [number, number, number] {
        const corners = this.cornersOf(cell);
        const centre: [number, number, number] = [0, 0, 0];
        for (const node of corners) {
            const place = this.place(node);
            for (const k of [0, 1, 2] as const) centre[k] += place[k] / corners.length;
        }
        return centre;
    }

    /** Of a face its normal, of a line its direction; of length 1, or 0 for none. */
    directionOf(cell: number): [number, number, number] {
        const corners = this.cornersOf(cell).map((node) => this.place(node));
        const sum: [number, number, number] = [0, 0, 0];
        if (corners.length === 2) {
            for (const k of [0, 1, 2] as const) sum[k] = at(corners, 1)[k] - at(corners, 0)[k];
        } else {
            corners.forEach((a, i) => {
                const b = at(corners, (i + 1) % corners.length);
                sum[0] += (a[1] - b[1]) * (a[2] + b[2]);
                sum[1] += (a[2] - b[2]) * (a[0] + b[0]);
                sum[2] += (a[0] - b[0]) * (a[1] + b[1]);
            });
        }
        const length = Math.hypot(...sum);
        return length === 0 ? [0, 0, 0] : [sum[0] / length, sum[1] / length, sum[2] / length];
    }

    /** Indices of the pieces of cells that have the dimension, and the cell of each piece. */
    pieces(cells: Iterable<number>, dimension: Dimension): { index: number[]; cellOf: number[] } {
        const index: number[] = [];
        const cellOf: number[] = [];
        for (const cell of cells) {
            const place = this.blockOf(cell);
            const block = at(this.blocks, place);
            if (dimensionOf(block) !== dimension) continue;
            const row = this.row(place);
            const begin = (cell - block.first) * block.nodes;
            const pieces = piecesOf(block);
            for (let i = 0; i < pieces.length; ++i) {
                index.push(at(row, begin + at(pieces, i)));
                if (i % (dimension + 1) === 0) cellOf.push(cell);
            }
        }
        return { index, cellOf };
    }

    /** The lines along all edges of all cells but facets, each once. */
    elementEdges(): number[] {
        const index: number[] = [];
        const seen = new Set<number>();
        const nodes = this.positions.length / 3;
        this.blocks.forEach((block, place) => {
            if (block.role === "facet" || dimensionOf(block) !== 2) return;
            const row = this.row(place);
            const edges = edgesOf(block);
            for (let begin = 0; begin < row.length; begin += block.nodes) {
                for (let i = 0; i < edges.length; i += 2) {
                    const a = at(row, begin + at(edges, i));
                    const b = at(row, begin + at(edges, i + 1));
                    const key = Math.min(a, b) * nodes + Math.max(a, b);
                    if (seen.has(key)) continue;
                    seen.add(key);
                    index.push(a, b);
                }
            }
        });
        return index;
    }
}

/** At most `most` of the items, spread evenly. */
export function sampled<T>(items: readonly T[], most: number): T[] {
    if (items.length <= most) return items.slice();
    const picked: T[] = [];
    for (let i = 0; i < most; ++i) picked.push(at(items, Math.floor(((i + 0.5) * items.length) / most)));
    return picked;
}
