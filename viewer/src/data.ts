// The data of a page as docs/view.md describes it: one header, and binary arrays that it names by number.

export type Triple = [number, number, number];

export interface ArrayEntry {
    type: "u8" | "u16" | "i16" | "i32" | "f32";
    offset: number;
    length: number;
}

export type Role = "solid" | "shell" | "sheet" | "line" | "connector" | "point" | "unknown" | "facet";

export interface Block {
    role: Role;
    cell: string;
    corners: number;
    nodes: number;
    type: string;
    first: number;
    count: number;
    connectivity: number;
    labels: number;
    sides?: number;
}

export interface SetPart {
    cells?: number;
    negative?: number;
    nodes?: number;
    box?: [number, number, number, number, number, number];
}

export interface SetHead {
    name: string;
    kind: "node" | "element" | "surface";
    internal: boolean;
    count: number;
}

export type MeshSet = SetHead & SetPart;
export type AssemblySet = SetHead & { parts: (SetPart & { instance: number })[] };

export interface MeshText {
    nodes: number;
    elements: number;
    positions: number;
    nodeLabels: number;
    edges: number;
    blocks: Block[];
    sets: MeshSet[];
    unknown: Record<string, number>;
}

export interface Region {
    instance: number;
    set: number;
}

export interface Orientation {
    region: Region | null;
    kind: "material" | "beam" | "connector";
    datum?: number;
    axis?: number;
    angle?: number;
    vector?: Triple;
}

export interface Instance {
    name: string;
    kind: "instance" | "assembly" | "part";
    part: string;
    mesh: number;
    placement: number[];
    sections?: number;
    orientations?: Orientation[];
}

export interface Section {
    name: string;
    class: string;
    doc: string;
    material: string;
    profile?: string;
    outline?: [number, number][][];
}

export interface Field {
    name: string;
    value: unknown;
    doc: string;
}

export interface State {
    fields: Field[];
    components?: (number | null)[];
    magnitude?: number;
}

export interface Card {
    loadCase: string;
    text: string;
}

export interface ModelObject {
    kind: string;
    name: string;
    class: string;
    label: string;
    doc: string;
    mark: string;
    suppressed: boolean;
    fields: Field[];
    regions: (Region & { role: string })[];
    states: State[];
    cards: Card[][];
    /** For each step: places of its status, its state and its card, or -1. */
    steps: [number, number, number][];
    axis?: [Triple, Triple];
    direction?: Triple;
    datum?: number;
}

export interface Step {
    name: string;
    procedure: string;
    description: string;
    perturbation: boolean;
    loadCases: string[];
    period?: number;
    /** Its own in the deck: what begins it, and its procedure. */
    lines?: string;
}

export interface Datum {
    name: string;
    type: string;
    system: string;
    origin: Triple;
    axes: [Triple, Triple, Triple];
}

export interface Header {
    format: string;
    title: string;
    description: string;
    arrays: ArrayEntry[];
    meshes: MeshText[];
    instances: Instance[];
    sets: AssemblySet[];
    sections: Section[];
    statuses: { name: string; words: string; active: boolean }[];
    steps: Step[];
    datums: Datum[];
    objects: ModelObject[];
}

export type Numbers = Uint8Array | Uint16Array | Int16Array | Int32Array | Float32Array;

export function bytesOfBase64(text: string): Uint8Array {
    const binary = atob(text);
    const bytes = new Uint8Array(binary.length);
    for (let i = 0; i < binary.length; ++i) bytes[i] = binary.charCodeAt(i);
    return bytes;
}

/** What a set has in one instance: cells and nodes of the instance's mesh. */
export interface Part {
    instance: number;
    cells: number[];
    negative: number[];
    nodes: number[];
    box: SetPart["box"];
}

export class Model {
    readonly cellBlocks = new Map<number, number[]>();

    constructor(
        readonly header: Header,
        private readonly bytes: Uint8Array,
    ) {
        if (header.format !== "qrx-page/1") throw new Error(`This page can't show data of the form ${header.format}.`);
    }

    numbers(index: number): Numbers {
        const entry = at(this.header.arrays, index);
        const buffer = this.bytes.buffer;
        const offset = this.bytes.byteOffset + entry.offset;
        switch (entry.type) {
            case "u8":
                return new Uint8Array(buffer, offset, entry.length);
            case "u16":
                return new Uint16Array(buffer, offset, entry.length);
            case "i16":
                return new Int16Array(buffer, offset, entry.length);
            case "i32":
                return new Int32Array(buffer, offset, entry.length);
            case "f32":
                return new Float32Array(buffer, offset, entry.length);
        }
    }

    /** All numbers of an array of runs: first, length, first, length, ... */
    unrolled(index: number | undefined): number[] {
        if (index === undefined) return [];
        const runs = this.numbers(index);
        const all: number[] = [];
        for (let i = 0; i + 1 < runs.length; i += 2) {
            const first = at(runs, i);
            for (let k = 0; k < at(runs, i + 1); ++k) all.push(first + k);
        }
        return all;
    }

    instance(index: number): Instance {
        return at(this.header.instances, index);
    }

    meshOf(instance: number): MeshText {
        return at(this.header.meshes, this.instance(instance).mesh);
    }

    setOf(region: Region): SetHead | undefined {
        return region.instance < 0 ? this.header.sets[region.set] : this.meshOf(region.instance).sets[region.set];
    }

    /** "Instance.Set", or the set's name alone for one of the assembly. */
    nameOf(region: Region): string {
        const name = this.setOf(region)?.name ?? "";
        return region.instance < 0 ? name : `${this.instance(region.instance).name}.${name}`;
    }

    partsOf(region: Region): Part[] {
        const set = this.setOf(region);
        if (set === undefined) return [];
        const parts = "parts" in set ? (set as AssemblySet).parts : [{ ...(set as MeshSet), instance: region.instance }];
        return parts.map((part) => ({
            instance: part.instance,
            cells: this.unrolled(part.cells),
            negative: this.unrolled(part.negative),
            nodes: this.unrolled(part.nodes),
            box: part.box,
        }));
    }

    /** All sets, those of instances instance by instance, then the assembly's. */
    *regions(): Generator<Region> {
        for (let i = 0; i < this.header.instances.length; ++i) {
            for (let k = 0; k < this.meshOf(i).sets.length; ++k) yield { instance: i, set: k };
        }
        for (let k = 0; k < this.header.sets.length; ++k) yield { instance: -1, set: k };
    }

    isActive(object: ModelObject, step: number): boolean {
        const entry = object.steps[step];
        if (entry === undefined || object.suppressed) return false;
        return entry[0] < 0 || (this.header.statuses[entry[0]]?.active ?? false);
    }

    statusWords(object: ModelObject, step: number): string {
        if (object.suppressed) return "suppressed";
        const entry = object.steps[step];
        if (entry === undefined) return "";
        return entry[0] < 0 ? "holds in all steps" : (this.header.statuses[entry[0]]?.words ?? "");
    }

    /** Whether the step, a perturbation, finds the object's effect in the state that it starts from. */
    isBuiltIn(object: ModelObject, step: number): boolean {
        return this.header.statuses[object.steps[step]?.[0] ?? -1]?.name === "BUILT_INTO_BASE_STATE";
    }

    stateIn(object: ModelObject, step: number): State | undefined {
        return object.states[object.steps[step]?.[1] ?? -1];
    }

    /** The object's lines in the step; or, where it is only carried on, those of the last step that wrote it. */
    cardOf(object: ModelObject, step: number): { card: Card[]; step: number } | undefined {
        for (let i = step; i >= 0; --i) {
            const card = object.cards[object.steps[i]?.[2] ?? -1];
            if (card !== undefined) return { card, step: i };
            if (i < step && !this.isActive(object, i)) return undefined;
        }
        return undefined;
    }
}

/** The item at a place where there must be one. */
export function at<T>(list: ArrayLike<T>, index: number): T {
    const item = list[index];
    if (item === undefined) throw new RangeError(`There is no item ${index} of ${list.length}.`);
    return item;
}
