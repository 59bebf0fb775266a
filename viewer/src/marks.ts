// What acts in a step, drawn where it acts.
import {
    BufferAttribute,
    BufferGeometry,
    Color,
    ConeGeometry,
    CylinderGeometry,
    Group,
    InstancedMesh,
    LineBasicMaterial,
    LineSegments,
    Matrix4,
    MeshLambertMaterial,
    type Object3D,
    OctahedronGeometry,
    Quaternion,
    Raycaster,
    SphereGeometry,
    TorusGeometry,
    Vector2,
    Vector3,
} from "three";
import { mergeGeometries } from "three/examples/jsm/utils/BufferGeometryUtils.js";
import { at, type Model, type ModelObject, type Part, type Region } from "./data";
import type { Body } from "./body";
import { type Axes, axesAt, globalAxes, matrixOf, turnedAxes } from "./frames";
import { sampled } from "./shapes";
import type { Stage } from "./stage";

export const kindColours: Record<string, string> = {
    boundaryConditions: "#e07a00",
    loads: "#d1105a",
    fields: "#00857a",
    interactions: "#6a3ec2",
    constraints: "#3f7d1c",
};
const secondTint = "#c79a00";

/** So many marks show one object at most; they are spread over its region. */
const mostMarks = 120;
/** At so many of them its name may point. */
const mostPlaces = 24;

type Shape = "arrow" | "double" | "cone" | "bar" | "dot" | "ball" | "ring";

/** Shapes of length 1 along y, the arrows' points at the far end. */
function makeShapes(): Record<Shape, BufferGeometry> {
    const cone = (radius: number, height: number, base: number) => new ConeGeometry(radius, height, 12).translate(0, base + height / 2, 0);
    const shaft = (length: number) => new CylinderGeometry(0.05, 0.05, length, 8).translate(0, length / 2, 0);
    const merged = (...parts: BufferGeometry[]) => mergeGeometries(parts.map((part) => part.toNonIndexed()));
    return {
        arrow: merged(shaft(0.75), cone(0.15, 0.32, 0.68)),
        double: merged(shaft(0.6), cone(0.15, 0.25, 0.5), cone(0.15, 0.25, 0.75)),
        // Its point is at the origin, where it holds.
        cone: new ConeGeometry(0.26, 0.6, 10).translate(0, -0.3, 0),
        bar: merged(new CylinderGeometry(0.1, 0.1, 0.9, 8), new CylinderGeometry(0.26, 0.26, 0.1, 12)),
        dot: new OctahedronGeometry(0.22),
        ball: new SphereGeometry(0.2, 12, 8),
        ring: merged(
            new TorusGeometry(0.8, 0.035, 8, 36, 5.2).rotateX(Math.PI / 2) as BufferGeometry,
            new ConeGeometry(0.12, 0.32, 10).rotateX(Math.PI / 2).translate(0.8, 0, 0.12),
        ),
    };
}

interface Placed {
    shape: Shape;
    colour: string;
    place: Vector3;
    direction: Vector3;
    length: number;
    /** How far it goes from its place along its direction. */
    reach: number;
}

/** What acts on: faces with normals out of the body, and places. */
interface Spot {
    place: Vector3;
    normal: Vector3;
}

export interface ActiveMark {
    object: ModelObject;
    index: number;
}

export class Marks {
    readonly group = new Group();
    private readonly shapes = makeShapes();
    private readonly triads = new Group();
    private readonly hiddenKinds = new Set<string>();
    private shownStep = -1;
    /** Told after each change of what is drawn. */
    changed: () => void = () => undefined;

    constructor(
        private readonly model: Model,
        private readonly body: Body,
        private readonly stage: Stage,
    ) {
        stage.scene.add(this.group, this.triads);
        this.triads.visible = false;
    }

    private get unit(): number {
        return this.stage.size * 0.055;
    }

    hideKind(kind: string, hidden: boolean): void {
        if (hidden) this.hiddenKinds.add(kind);
        else this.hiddenKinds.delete(kind);
        this.show(this.shownStep);
    }

    isHidden(kind: string): boolean {
        return this.hiddenKinds.has(kind);
    }

    /** Draws all that is active in the step; `without` leaves one object out. */
    show(step: number, without = -1): void {
        this.shownStep = step;
        this.clear(this.group);
        this.model.header.objects.forEach((object, index) => {
            if (index === without || this.hiddenKinds.has(object.kind) || !this.model.isActive(object, step)) return;
            const drawn = this.draw(object, step);
            drawn.userData["object"] = index;
            this.group.add(drawn);
        });
        this.stage.marked.setFromPoints(this.named().flatMap(({ places }) => places));
        this.changed();
        this.stage.draw();
    }

    /** The objects that are drawn, each with places at which a name can point. */
    named(): { object: number; places: Vector3[] }[] {
        return this.group.children.map((child) => ({ object: child.userData["object"] as number, places: child.userData["places"] as Vector3[] }));
    }

    private clear(group: Group): void {
        for (const child of [...group.children]) {
            child.traverse((object) => {
                if (object instanceof InstancedMesh) object.dispose();
            });
            group.remove(child);
        }
    }

    /** The object whose mark lies under a point of the canvas. */
    pick(x: number, y: number): number | undefined {
        const { clientWidth: width, clientHeight: height } = this.stage.canvas;
        const caster = new Raycaster();
        caster.setFromCamera(new Vector2((2 * x) / width - 1, 1 - (2 * y) / height), this.stage.camera);
        caster.params.Line.threshold = this.stage.size * 0.004;
        caster.params.Points.threshold = this.stage.size * 0.004;
        const solid = this.group.children.flatMap((child) => child.children.filter((part) => part instanceof InstancedMesh));
        const found = caster.intersectObjects(solid, false).find((hit) => !this.stage.isCutAway(hit.point));
        return found?.object.parent?.userData["object"] as number | undefined;
    }

    private draw(object: ModelObject, step: number): Group {
        const group = new Group();
        const colour = kindColours[object.kind] ?? "#888888";
        const marks: Placed[] = [];
        const state = this.model.stateIn(object, step);
        const parts = object.regions.flatMap((region) => this.model.partsOf(region));
        const tint = (some: Part[], shade: string, opacity: number) => {
            // Fields cover whole bodies; all else may lie between two of them.
            const throughBodies = object.kind !== "fields";
            for (const part of some) for (const drawn of this.body.overlay(part, shade, opacity, throughBodies)) group.add(drawn);
        };
        switch (object.mark) {
            case "support":
                this.supports(object, parts, state?.components ?? [], colour, marks);
                break;
            case "force":
            case "moment":
                this.vectors(object, parts, state?.components ?? [], object.mark === "force" ? "arrow" : "double", colour, marks);
                break;
            case "pressure":
                tint(parts, colour, 0.3);
                this.pressures(parts, state?.magnitude ?? 0, colour, marks);
                break;
            case "traction":
                tint(parts, colour, 0.3);
                this.tractions(object, parts, state?.magnitude ?? 0, colour, marks);
                break;
            case "spread":
                tint(parts, colour, 0.22);
                this.spread(parts, state?.components ?? [], colour, marks);
                break;
            case "gravity":
                this.gravity(state?.components ?? [], colour, marks);
                break;
            case "rotation":
                this.rotation(object, group, colour, marks);
                break;
            case "bolt":
                tint(parts, colour, 0.5);
                this.bolt(parts, state?.magnitude ?? 0, colour, marks);
                break;
            case "nodes":
            case "connector":
                for (const spot of sampled(this.spots(parts), mostMarks)) marks.push(this.at(spot.place, "dot", colour));
                tint(parts.filter((part) => part.cells.length > 0), colour, 0.5);
                break;
            case "pair":
                object.regions.forEach((region, i) => tint(this.model.partsOf(region), i % 2 === 0 ? colour : secondTint, 0.55));
                break;
            case "couple":
                this.couple(object, group, colour, marks);
                break;
            case "tint":
                tint(parts, colour, 0.42);
                break;
            default:
                break;
        }
        this.addMarks(group, marks, this.model.isBuiltIn(object, step));
        const drawn = sampled(marks, mostPlaces).flatMap((mark) => [mark.place, mark.place.clone().addScaledVector(mark.direction, mark.reach)]);
        group.userData["places"] = drawn.length > 0 ? drawn : sampled(this.spots(parts), mostPlaces).map((spot) => spot.place);
        return group;
    }

    private at(place: Vector3, shape: Shape, colour: string, direction = new Vector3(0, 1, 0), length = this.unit): Placed {
        const reach = length * { arrow: 1, double: 1, cone: -0.6, bar: 0, dot: 0, ball: 0, ring: 0 }[shape];
        return { shape, colour, place, direction, length, reach };
    }

    /** Places of a region: its nodes, or the middles of its cells with their normals. */
    private spots(parts: Part[]): Spot[] {
        const spots: Spot[] = [];
        for (const part of parts) {
            const { cells, instance } = at(this.body.instances, part.instance);
            const matrix = matrixOf(instance);
            for (const node of part.nodes) {
                spots.push({ place: this.body.worldPlace(part.instance, node), normal: new Vector3() });
            }
            for (const [list, sign] of [[part.cells, 1], [part.negative, -1]] as const) {
                for (const cell of sampled(list, 2 * mostMarks)) {
                    const normal = new Vector3(...cells.directionOf(cell)).transformDirection(matrix).multiplyScalar(sign);
                    spots.push({ place: new Vector3(...cells.centreOf(cell)).applyMatrix4(matrix), normal });
                }
            }
        }
        return spots;
    }

    /** Nodes of a region, those of its cells among them. */
    private nodePlaces(parts: Part[]): Vector3[] {
        const places: Vector3[] = [];
        for (const part of parts) {
            const { cells } = at(this.body.instances, part.instance);
            const nodes = new Set(part.nodes);
            for (const cell of [...part.cells, ...part.negative]) for (const node of cells.cornersOf(cell)) nodes.add(node);
            for (const node of nodes) places.push(this.body.worldPlace(part.instance, node));
        }
        return places;
    }

    private axesOf(object: ModelObject, place: Vector3): Axes {
        const datum = object.datum === undefined ? undefined : this.model.header.datums[object.datum - 1];
        return datum === undefined ? globalAxes() : axesAt(datum, place);
    }

    private supports(object: ModelObject, parts: Part[], components: (number | null)[], colour: string, marks: Placed[]): void {
        const darker = "#" + new Color(colour).lerp(new Color("#000000"), 0.35).getHexString();
        for (const place of sampled(this.nodePlaces(parts), mostMarks)) {
            const axes = this.axesOf(object, place);
            components.forEach((value, dof) => {
                if (value === null) return;
                const axis = at(axes, dof % 3);
                if (value === 0) {
                    marks.push(this.at(place, dof < 3 ? "cone" : "bar", dof < 3 ? colour : darker, axis, this.unit * 0.5));
                } else {
                    const direction = axis.clone().multiplyScalar(Math.sign(value));
                    marks.push(this.at(place, dof < 3 ? "arrow" : "double", darker, direction, this.unit * 1.5));
                }
            });
        }
    }

    private vectors(object: ModelObject, parts: Part[], components: (number | null)[], shape: Shape, colour: string, marks: Placed[]): void {
        for (const place of sampled(this.nodePlaces(parts), mostMarks)) {
            const axes = this.axesOf(object, place);
            const direction = new Vector3();
            components.forEach((value, i) => direction.addScaledVector(at(axes, i), value ?? 0));
            if (direction.length() > 0) marks.push(this.at(place, shape, colour, direction.normalize(), this.unit * 2));
        }
    }

    private pressures(parts: Part[], magnitude: number, colour: string, marks: Placed[]): void {
        const length = this.unit * 1.4;
        for (const { place, normal } of sampled(this.spots(parts), mostMarks)) {
            if (normal.length() === 0 || magnitude === 0) continue;
            // Pressure points at the face, suction away from it.
            const away = normal.clone().multiplyScalar(length);
            if (magnitude > 0) marks.push(this.at(place.clone().add(away), "arrow", colour, normal.clone().negate(), length));
            else marks.push(this.at(place, "arrow", colour, normal, length));
        }
    }

    private tractions(object: ModelObject, parts: Part[], magnitude: number, colour: string, marks: Placed[]): void {
        for (const { place, normal } of sampled(this.spots(parts), mostMarks)) {
            const axes = this.axesOf(object, place);
            const direction = new Vector3();
            (object.direction ?? [0, 0, 0]).forEach((value, i) => direction.addScaledVector(at(axes, i), value));
            if (direction.length() === 0) direction.copy(normal).negate();
            if (direction.length() === 0 || magnitude === 0) continue;
            direction.normalize().multiplyScalar(Math.sign(magnitude));
            marks.push(this.at(place, "arrow", colour, direction, this.unit * 1.3));
        }
    }

    private spread(parts: Part[], components: (number | null)[], colour: string, marks: Placed[]): void {
        const direction = new Vector3(...components.map((value) => value ?? 0));
        if (direction.length() === 0) return;
        direction.normalize();
        for (const { place } of sampled(this.spots(parts), mostMarks / 2)) {
            marks.push(this.at(place.clone().addScaledVector(direction, -this.unit * 1.4), "arrow", colour, direction, this.unit * 1.4));
        }
    }

    private gravity(components: (number | null)[], colour: string, marks: Placed[]): void {
        const direction = new Vector3(...components.map((value) => value ?? 0));
        if (direction.length() === 0) return;
        direction.normalize();
        const length = this.unit * 3;
        const centre = this.stage.box.getCenter(new Vector3());
        const reach = this.stage.box.getSize(new Vector3()).multiply(direction).length() / 2;
        marks.push(this.at(centre.addScaledVector(direction, -(reach + length * 1.1)), "arrow", colour, direction, length));
    }

    private rotation(object: ModelObject, group: Group, colour: string, marks: Placed[]): void {
        if (object.axis === undefined) return;
        const [from, to] = object.axis.map((point) => new Vector3(...point)) as [Vector3, Vector3];
        const direction = to.clone().sub(from);
        if (direction.length() === 0) return;
        direction.normalize();
        const middle = from.clone().addScaledVector(direction, this.stage.box.getCenter(new Vector3()).sub(from).dot(direction));
        const reach = this.stage.size * 0.6;
        group.add(this.lines([middle.clone().addScaledVector(direction, -reach), middle.clone().addScaledVector(direction, reach)], colour));
        marks.push(this.at(middle.addScaledVector(direction, reach * 0.85), "ring", colour, direction, this.unit * 2.5));
    }

    /** Two arrows that pull the bolt's halves together, or apart. */
    private bolt(parts: Part[], magnitude: number, colour: string, marks: Placed[]): void {
        const spots = this.spots(parts);
        if (spots.length === 0) return;
        const centre = new Vector3();
        const normal = new Vector3();
        for (const spot of spots) {
            centre.addScaledVector(spot.place, 1 / spots.length);
            normal.add(spot.normal);
        }
        if (normal.length() === 0) normal.set(0, 0, 1);
        normal.normalize();
        const length = this.unit * 2;
        for (const sign of [1, -1]) {
            const out = normal.clone().multiplyScalar(sign);
            const inward = magnitude >= 0;
            const place = inward ? centre.clone().addScaledVector(out, length) : centre.clone();
            marks.push(this.at(place, "arrow", colour, inward ? out.negate() : out, length));
        }
    }

    /** Lines from the reference node, or from one term of an equation to the next. */
    private couple(object: ModelObject, group: Group, colour: string, marks: Placed[]): void {
        const places = (region: Region) => this.nodePlaces(this.model.partsOf(region));
        const reference = object.regions.find((region) => region.role === "refNode");
        const ends: Vector3[] = [];
        if (reference !== undefined) {
            const centre = places(reference)[0];
            if (centre === undefined) return;
            marks.push(this.at(centre, "ball", colour));
            for (const region of object.regions) {
                if (region === reference) continue;
                for (const place of sampled(places(region), 300)) ends.push(centre, place);
            }
        } else {
            const centres = object.regions.map((region) => {
                const all = places(region);
                for (const place of sampled(all, 40)) marks.push(this.at(place, "dot", colour));
                return all.reduce((sum, place) => sum.addScaledVector(place, 1 / all.length), new Vector3());
            });
            for (let i = 1; i < centres.length; ++i) ends.push(at(centres, i - 1), at(centres, i));
        }
        if (ends.length > 0) group.add(this.lines(ends, colour));
    }

    private lines(ends: Vector3[], colour: string): Object3D {
        const geometry = new BufferGeometry().setFromPoints(ends);
        const lines = new LineSegments(geometry, new LineBasicMaterial({ color: new Color(colour), depthTest: false, transparent: true, opacity: 0.8 }));
        lines.renderOrder = 6;
        return lines;
    }

    /** Marks of one shape and colour in one go; faint where something hides them, or all of them. */
    private addMarks(group: Group, marks: Placed[], allFaint = false): void {
        const alike = new Map<string, Placed[]>();
        for (const mark of marks) {
            const key = mark.shape + mark.colour;
            const same = alike.get(key);
            if (same === undefined) alike.set(key, [mark]);
            else same.push(mark);
        }
        const up = new Vector3(0, 1, 0);
        for (const same of alike.values()) {
            const first = at(same, 0);
            const geometry = this.shapes[first.shape];
            const material = new MeshLambertMaterial({ color: new Color(first.colour) });
            if (allFaint) Object.assign(material, { transparent: true, opacity: 0.2, depthWrite: false });
            const solid = new InstancedMesh(geometry, material, same.length);
            same.forEach((mark, i) => {
                const turn = new Quaternion().setFromUnitVectors(up, mark.direction.clone().normalize());
                solid.setMatrixAt(i, new Matrix4().compose(mark.place, turn, new Vector3().setScalar(mark.length)));
            });
            const faint = new MeshLambertMaterial({ color: new Color(first.colour), transparent: true, opacity: 0.22, depthTest: false, depthWrite: false });
            const ghost = new InstancedMesh(geometry, faint, same.length);
            ghost.instanceMatrix = solid.instanceMatrix;
            ghost.renderOrder = 7;
            solid.renderOrder = 8;
            group.add(solid, ghost);
        }
    }

    /** The axes of all orientations, at the middles of their regions. */
    showTriads(on: boolean): void {
        if (on && this.triads.children.length === 0) this.makeTriads();
        this.triads.visible = on;
        this.stage.draw();
    }

    private makeTriads(): void {
        const marks: Placed[] = [];
        const colours = ["#d02020", "#209020", "#2050d0"];
        for (const instance of this.model.header.instances) {
            const matrix = matrixOf(instance);
            for (const orientation of instance.orientations ?? []) {
                if (orientation.region === null) continue;
                const spots = this.spots(this.model.partsOf(orientation.region));
                for (const { place } of sampled(spots, 12)) {
                    this.orientationAxes(orientation, place.clone().applyMatrix4(matrix.clone().invert())).forEach((axis, i) => {
                        const direction = axis.clone().transformDirection(matrix);
                        if (direction.length() > 0) marks.push(this.at(place, "arrow", at(colours, i), direction, this.unit * 0.9));
                    });
                }
            }
        }
        this.addMarks(this.triads, marks);
    }

    private orientationAxes(orientation: { datum?: number; axis?: number; angle?: number; vector?: [number, number, number] }, place: Vector3): Vector3[] {
        if (orientation.vector !== undefined) return [new Vector3(...orientation.vector).normalize()];
        const datum = this.model.header.datums[(orientation.datum ?? 0) - 1];
        if (datum === undefined) return [];
        return turnedAxes(axesAt(datum, place), orientation.axis ?? 0, orientation.angle ?? 0);
    }
}

/** The outlines of beams and trusses at both ends of each, and lines along them. */
export function profileLines(model: Model, body: Body): LineSegments | undefined {
    const ends: number[] = [];
    for (const shown of body.instances) {
        const { sections } = shown.instance;
        if (sections === undefined) continue;
        const ofCell = model.numbers(sections);
        const firstAxes = new Map<number, Vector3>();
        for (const orientation of shown.instance.orientations ?? []) {
            if (orientation.kind !== "beam" || orientation.region === null || orientation.vector === undefined) continue;
            const vector = new Vector3(...orientation.vector);
            for (const part of model.partsOf(orientation.region)) for (const cell of part.cells) firstAxes.set(cell, vector);
        }
        const matrix = matrixOf(shown.instance);
        for (const block of shown.cells.blocks) {
            if (block.role !== "line") continue;
            for (let cell = block.first; cell < block.first + block.count; ++cell) {
                const outline = model.header.sections[ofCell[cell] ?? -1]?.outline;
                if (outline === undefined) continue;
                const [a, b] = shown.cells.cornersOf(cell).map((node) => new Vector3(...shown.cells.place(node)));
                if (a !== undefined && b !== undefined) addPrism(a, b, outline, firstAxes.get(cell), matrix, ends);
            }
        }
    }
    if (ends.length === 0) return undefined;
    const geometry = new BufferGeometry();
    geometry.setAttribute("position", new BufferAttribute(new Float32Array(ends), 3));
    return new LineSegments(geometry, new LineBasicMaterial({ color: 0x4a6a8a }));
}

function addPrism(a: Vector3, b: Vector3, outline: [number, number][][], first: Vector3 | undefined, matrix: Matrix4, ends: number[]): void {
    const along = b.clone().sub(a).normalize();
    const one = (first ?? new Vector3(0, 0, -1)).clone();
    one.addScaledVector(along, -one.dot(along));
    if (one.length() < 1e-9) one.set(along.y, along.z, along.x).cross(along);
    one.normalize();
    const two = new Vector3().crossVectors(along, one);
    const place = (base: Vector3, [x, y]: [number, number]) =>
        base.clone().addScaledVector(one, x).addScaledVector(two, y).applyMatrix4(matrix).toArray();
    for (const line of outline) {
        const step = line.length > 16 ? Math.floor(line.length / 4) : 1;
        line.forEach((point, i) => {
            const next = line[i + 1];
            if (next !== undefined) for (const base of [a, b]) ends.push(...place(base, point), ...place(base, next));
            if (i % step === 0) ends.push(...place(a, point), ...place(b, point));
        });
    }
}
