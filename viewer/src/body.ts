// The model itself: instances in their places, coloured, with edges; sets that light up; what lies under a point.
import {
    Box3,
    BufferAttribute,
    BufferGeometry,
    Color,
    DoubleSide,
    GreaterDepth,
    Group,
    LineBasicMaterial,
    LineSegments,
    type Material,
    Matrix4,
    Mesh,
    MeshLambertMaterial,
    type Object3D,
    Points,
    PointsMaterial,
    Raycaster,
    Vector2,
    Vector3,
} from "three";
import { at, type Instance, type Model, type Part, type Region } from "./data";
import { Cells, type Dimension, dimensionOf } from "./shapes";
import type { Stage } from "./stage";

export type ColourBy = "instance" | "section" | "material" | "type";

export interface LegendEntry {
    name: string;
    colour: string;
    cells: number;
}

export interface Hit {
    instance: number;
    cell: number;
    type: string;
    label: number;
    side: number | undefined;
    node: number;
    place: Vector3;
}

/** Colours that stay apart, the first of them calm. */
export function paletteColour(index: number): string {
    const hue = (211 + index * 137.508) % 360;
    const light = [62, 52, 70][index % 3] ?? 60;
    return `hsl(${hue.toFixed(1)}, ${index === 0 ? 32 : 46}%, ${light}%)`;
}

const none = "hsl(0, 0%, 62%)";

/** Faces seen from behind: the inside of solids is dark, the negative side of shells of another tint. */
function faceMaterial(colour: string, shell: boolean): MeshLambertMaterial {
    const material = new MeshLambertMaterial({
        color: new Color(colour),
        flatShading: true,
        side: DoubleSide,
        polygonOffset: true,
        polygonOffsetFactor: 1,
        polygonOffsetUnits: 1,
    });
    const behind = shell ? "mix(diffuseColor.rgb, vec3(0.72, 0.36, 0.10), 0.62)" : "diffuseColor.rgb * 0.45";
    material.onBeforeCompile = (shader) => {
        shader.fragmentShader = shader.fragmentShader.replace(
            "#include <color_fragment>",
            `#include <color_fragment>\nif (!gl_FrontFacing) diffuseColor.rgb = ${behind};`,
        );
    };
    material.customProgramCacheKey = () => (shell ? "shell" : "solid");
    return material;
}

function isShell(role: string): boolean {
    return role === "shell" || role === "sheet";
}

interface Layer {
    dimension: Dimension;
    shell: boolean;
    cells: number[];
}

interface Drawn {
    object: Mesh | LineSegments | Points;
    /** Of each piece in the order of the index. */
    cellOf: number[];
}

class InstanceBody {
    readonly group = new Group();
    readonly box = new Box3();
    private drawn: Drawn[] = [];
    private edges: LineSegments | undefined;
    private mesh: LineSegments | undefined;

    constructor(
        readonly index: number,
        readonly instance: Instance,
        readonly cells: Cells,
        readonly positions: BufferAttribute,
        private readonly featureEdges: BufferAttribute,
        private readonly layers: Layer[],
    ) {
        const [a, b, c, d, e, f, g, h, i, j, k, l] = instance.placement as [
            number, number, number, number, number, number, number, number, number, number, number, number,
        ];
        this.group.matrixAutoUpdate = false;
        this.group.matrix = new Matrix4().set(a, b, c, d, e, f, g, h, i, j, k, l, 0, 0, 0, 1);
        this.group.matrixWorld.copy(this.group.matrix);
        const place = new Vector3();
        for (const layer of layers) {
            for (const node of cells.pieces(layer.cells, layer.dimension).index) {
                this.box.expandByPoint(place.fromBufferAttribute(positions, node).applyMatrix4(this.group.matrix));
            }
        }
    }

    geometry(index: number[] | BufferAttribute): BufferGeometry {
        const geometry = new BufferGeometry();
        geometry.setAttribute("position", this.positions);
        geometry.setIndex(index as number[]);
        return geometry;
    }

    /** Draws the cells, those of one colour in one go. */
    colour(colourOf: (cell: number) => string): void {
        for (const { object } of this.drawn) {
            this.group.remove(object);
            // The positions are all objects' and stay on the graphics card.
            object.geometry.deleteAttribute("position");
            object.geometry.dispose();
        }
        this.drawn = [];
        for (const layer of this.layers) {
            const byColour = new Map<string, number[]>();
            for (const cell of layer.cells) {
                const colour = colourOf(cell);
                const same = byColour.get(colour);
                if (same === undefined) byColour.set(colour, [cell]);
                else same.push(cell);
            }
            const index: number[] = [];
            const cellOf: number[] = [];
            const materials: Material[] = [];
            const groups: [number, number][] = [];
            for (const [colour, cells] of byColour) {
                const pieces = this.cells.pieces(cells, layer.dimension);
                groups.push([index.length, pieces.index.length]);
                for (const node of pieces.index) index.push(node);
                for (const cell of pieces.cellOf) cellOf.push(cell);
                materials.push(materialFor(layer, colour));
            }
            const geometry = this.geometry(index);
            groups.forEach(([first, count], i) => geometry.addGroup(first, count, i));
            const object = makeObject(layer.dimension, geometry, materials);
            this.drawn.push({ object, cellOf });
            this.group.add(object);
        }
        if (this.edges === undefined) {
            this.edges = new LineSegments(this.geometry(this.featureEdges), new LineBasicMaterial({ color: 0x1a2028 }));
            this.group.add(this.edges);
        }
    }

    showMesh(on: boolean): void {
        if (on && this.mesh === undefined) {
            const material = new LineBasicMaterial({ color: 0x1a2028, transparent: true, opacity: 0.45 });
            this.mesh = new LineSegments(this.geometry(this.cells.elementEdges()), material);
            this.group.add(this.mesh);
        }
        if (this.mesh !== undefined) this.mesh.visible = on;
    }

    objects(): Object3D[] {
        return this.drawn.map(({ object }) => object);
    }

    cellUnder(object: Object3D, piece: number): number | undefined {
        return this.drawn.find((drawn) => drawn.object === object)?.cellOf[piece];
    }

    get cellCount(): number {
        return this.layers.reduce((sum, layer) => sum + layer.cells.length, 0);
    }

    *allCells(): Generator<number> {
        for (const layer of this.layers) yield* layer.cells;
    }
}

function materialFor(layer: Layer, colour: string): Material {
    if (layer.dimension === 2) return faceMaterial(colour, layer.shell);
    const plain = new Color(colour).multiplyScalar(0.75);
    if (layer.dimension === 1) return new LineBasicMaterial({ color: plain });
    return new PointsMaterial({ color: plain, size: 9, sizeAttenuation: false });
}

function makeObject(dimension: Dimension, geometry: BufferGeometry, materials: Material[]): Mesh | LineSegments | Points {
    if (dimension === 2) return new Mesh(geometry, materials);
    return dimension === 1 ? new LineSegments(geometry, materials) : new Points(geometry, materials);
}

export class Body {
    readonly instances: InstanceBody[] = [];
    readonly meshes: Cells[];
    private readonly lit = new Group();
    private readonly hidden = new Set<number>();
    legend: LegendEntry[] = [];

    constructor(
        readonly model: Model,
        private readonly stage: Stage,
    ) {
        this.meshes = model.header.meshes.map((_, i) => new Cells(model, i));
        const positions = this.meshes.map((cells) => new BufferAttribute(cells.positions, 3));
        const edges = model.header.meshes.map((mesh) => new BufferAttribute(new Uint32Array(model.numbers(mesh.edges)), 1));
        const layers = this.meshes.map(layersOf);
        model.header.instances.forEach((instance, i) => {
            const { mesh } = instance;
            const body = new InstanceBody(i, instance, at(this.meshes, mesh), at(positions, mesh), at(edges, mesh), at(layers, mesh));
            this.instances.push(body);
            stage.content.add(body.group);
        });
        stage.scene.add(this.lit);
        const box = new Box3();
        for (const body of this.instances) box.union(body.box);
        stage.measure(box);
    }

    /** Colours all cells and works out the legend. */
    colour(by: ColourBy): void {
        const legend = new Map<string, LegendEntry>();
        const names = by === "instance" ? this.model.header.instances.map((instance) => instance.name) : [];
        const colourFor = (name: string): LegendEntry => {
            let entry = legend.get(name);
            if (entry === undefined) {
                const index = by === "instance" ? names.indexOf(name) : legend.size;
                entry = { name, colour: name === "" ? none : paletteColour(index), cells: 0 };
                legend.set(name, entry);
            }
            return entry;
        };
        for (const body of this.instances) {
            const nameOf = this.namer(body, by);
            body.colour((cell) => {
                const entry = colourFor(nameOf(cell));
                ++entry.cells;
                return entry.colour;
            });
        }
        this.legend = [...legend.values()];
        this.stage.draw();
    }

    private namer(body: InstanceBody, by: ColourBy): (cell: number) => string {
        if (by === "instance") return () => body.instance.name;
        if (by === "type") return (cell) => at(body.cells.blocks, body.cells.blockOf(cell)).type;
        const { sections } = body.instance;
        if (sections === undefined) return () => "";
        const ofCell = this.model.numbers(sections);
        return (cell) => {
            const section = this.model.header.sections[ofCell[cell] ?? -1];
            return (by === "section" ? section?.name : section?.material) ?? "";
        };
    }

    showMesh(on: boolean): void {
        for (const body of this.instances) body.showMesh(on);
        this.stage.draw();
    }

    showInstance(index: number, on: boolean): void {
        at(this.instances, index).group.visible = on;
        if (on) this.hidden.delete(index);
        else this.hidden.add(index);
        this.stage.draw();
    }

    isShown(index: number): boolean {
        return !this.hidden.has(index);
    }

    worldPlace(instance: number, node: number): Vector3 {
        const body = at(this.instances, instance);
        return new Vector3(...body.cells.place(node)).applyMatrix4(body.group.matrix);
    }

    /** Draws cells and nodes of an instance over the others; faintly, if so asked, where something hides them. */
    overlay(part: Part, colour: string, opacity: number, throughBodies = false): Object3D[] {
        const body = at(this.instances, part.instance);
        const group = new Group();
        group.matrixAutoUpdate = false;
        group.matrix.copy(body.group.matrix);
        const look = { color: new Color(colour), transparent: true, opacity };
        const cells = [...part.cells, ...part.negative];
        const faces = body.cells.pieces(cells, 2).index;
        if (faces.length > 0) {
            const material = new MeshLambertMaterial({ ...look, side: DoubleSide, flatShading: true, polygonOffset: true });
            material.polygonOffsetFactor = -1;
            material.polygonOffsetUnits = -1;
            const geometry = body.geometry(faces);
            group.add(new Mesh(geometry, material));
            if (throughBodies) {
                const faint = material.clone();
                Object.assign(faint, { opacity: 0.35 * opacity, depthFunc: GreaterDepth, depthWrite: false });
                group.add(new Mesh(geometry, faint));
            }
        }
        const lines = body.cells.pieces(cells, 1).index;
        if (lines.length > 0) group.add(new LineSegments(body.geometry(lines), new LineBasicMaterial({ ...look, depthTest: false })));
        const points = [...part.nodes, ...body.cells.pieces(cells, 0).index];
        if (points.length > 0) {
            const material = new PointsMaterial({ ...look, size: points.length > 500 ? 4 : 8, sizeAttenuation: false, depthTest: false });
            group.add(new Points(body.geometry(points), material));
        }
        group.renderOrder = 5;
        for (const child of group.children) child.renderOrder = 5;
        return [group];
    }

    /** Lights up sets, or whole instances, and tells where they are. */
    light(regions: Region[], instances: number[] = []): Box3 {
        for (const object of [...this.lit.children]) this.lit.remove(object);
        const box = new Box3();
        for (const region of regions) {
            for (const part of this.model.partsOf(region)) {
                for (const object of this.overlay(part, "#ffc400", 0.85)) this.lit.add(object);
                box.union(this.boxOf(part));
            }
        }
        for (const index of instances) {
            const body = at(this.instances, index);
            const cells = [...body.allCells()];
            for (const object of this.overlay({ instance: index, cells, negative: [], nodes: [], box: undefined }, "#ffc400", 0.5))
                this.lit.add(object);
            box.union(body.box);
        }
        this.stage.draw();
        return box;
    }

    boxOf(part: Part): Box3 {
        if (part.box === undefined) return new Box3();
        const [a, b, c, d, e, f] = part.box;
        return new Box3(new Vector3(a, b, c), new Vector3(d, e, f)).applyMatrix4(at(this.instances, part.instance).group.matrix);
    }

    /** What lies under a point of the picture, given in pixels of the canvas. */
    pick(x: number, y: number): Hit | undefined {
        const { clientWidth: width, clientHeight: height } = this.stage.canvas;
        const caster = new Raycaster();
        caster.setFromCamera(new Vector2((2 * x) / width - 1, 1 - (2 * y) / height), this.stage.camera);
        caster.params.Line.threshold = this.stage.size * 0.006;
        caster.params.Points.threshold = this.stage.size * 0.01;
        let best: { hit: Hit; distance: number } | undefined;
        for (const body of this.instances) {
            if (!body.group.visible) continue;
            for (const object of body.objects()) {
                for (const found of caster.intersectObject(object, false)) {
                    if (this.stage.isCutAway(found.point)) continue;
                    if (best !== undefined && found.distance >= best.distance) break;
                    const piece = found.faceIndex ?? (object instanceof Points ? (found.index ?? 0) : (found.index ?? 0) / 2);
                    const cell = body.cellUnder(object, object instanceof Points ? this.pointPiece(object, piece) : piece);
                    if (cell !== undefined) best = { hit: this.hitOf(body, cell, found.point), distance: found.distance };
                    break;
                }
            }
        }
        return best?.hit;
    }

    /** Points are found by their node. */
    private pointPiece(object: Points, node: number): number {
        const index = object.geometry.getIndex();
        for (let i = 0; index !== null && i < index.count; ++i) if (index.getX(i) === node) return i;
        return 0;
    }

    private hitOf(body: InstanceBody, cell: number, place: Vector3): Hit {
        const block = at(body.cells.blocks, body.cells.blockOf(cell));
        const inBlock = cell - block.first;
        let node = 0;
        let least = Infinity;
        for (const candidate of body.cells.nodesOf(cell)) {
            const distance = this.worldPlace(body.index, candidate).distanceTo(place);
            if (distance < least) [node, least] = [candidate, distance];
        }
        return {
            instance: body.index,
            cell,
            type: block.type,
            label: at(this.model.numbers(block.labels), inBlock),
            side: block.sides === undefined ? undefined : at(this.model.numbers(block.sides), inBlock) + 1,
            node: at(this.model.numbers(this.model.meshOf(body.index).nodeLabels), node),
            place,
        };
    }
}

function layersOf(cells: Cells): Layer[] {
    const layers: Layer[] = [];
    for (const block of cells.blocks) {
        if (block.role === "facet") continue;
        const dimension = dimensionOf(block);
        const shell = isShell(block.role);
        let layer = layers.find((known) => known.dimension === dimension && known.shell === shell);
        if (layer === undefined) {
            layer = { dimension, shell, cells: [] };
            layers.push(layer);
        }
        for (let i = 0; i < block.count; ++i) layer.cells.push(block.first + i);
    }
    return layers;
}
