// What a deck says of places: nodes, sets and surfaces of its instances, for tests that know nothing of the page's data.
const solidFaces = {
    8: { S1: [0, 1, 2, 3], S2: [4, 7, 6, 5], S3: [0, 4, 5, 1], S4: [1, 5, 6, 2], S5: [2, 6, 7, 3], S6: [3, 7, 4, 0] },
    4: { S1: [0, 1, 2], S2: [0, 3, 1], S3: [1, 3, 2], S4: [2, 3, 0] },
};

export const plus = (a, b, factor = 1) => a.map((x, i) => x + factor * b[i]);
export const dot = (a, b) => a.reduce((sum, x, i) => sum + x * b[i], 0);
export const cross = (a, b) => [a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]];
export const unit = (a) => a.map((x) => x / Math.hypot(...a));
const mean = (places) => places.reduce((sum, place) => plus(sum, place, 1 / places.length), [0, 0, 0]);

/** Turns a place by an angle in degrees about the line from one point to another. */
function turned(place, from, to, degrees) {
    const axis = unit(plus(to, from, -1));
    const arm = plus(place, from, -1);
    const [c, s] = [Math.cos((degrees * Math.PI) / 180), Math.sin((degrees * Math.PI) / 180)];
    const along = dot(axis, arm) * (1 - c);
    return plus(plus(plus(from, arm, c), cross(axis, arm), s), axis, along);
}

export class Deck {
    constructor(text) {
        this.instances = new Map();
        this.assembly = new Map();
        const lines = text.split("\n").filter((line) => !line.startsWith("**"));
        for (let i = 0; i < lines.length; ) {
            const [keyword, ...parameters] = lines[i].split(",").map((word) => word.trim());
            const given = Object.fromEntries(parameters.map((word) => word.split("=")));
            const data = [];
            for (++i; i < lines.length && !lines[i].startsWith("*"); ++i) data.push(lines[i].split(",").map((word) => word.trim()).filter((word) => word !== ""));
            this.take(keyword.toLowerCase(), given, data);
            if (keyword.toLowerCase() === "*step") break;
        }
    }

    take(keyword, given, data) {
        if (keyword === "*instance") {
            this.now = { nodes: new Map(), elements: new Map(), sets: new Map(), surfaces: new Map(), placed: data.map((row) => row.map(Number)) };
            this.instances.set(given.name, this.now);
        } else if (keyword === "*end instance") this.now = undefined;
        else if (keyword === "*node") for (const [label, ...place] of data) this.now.nodes.set(Number(label), this.moved(place.map(Number)));
        else if (keyword === "*element") for (const [label, ...nodes] of data) this.now?.elements.set(Number(label), { type: given.type, nodes: nodes.map(Number) });
        else if (keyword === "*nset" || keyword === "*elset") {
            const set = given.nset ?? given.elset;
            const labels = data.flatMap((row) => {
                const [first, last, by = 1] = row.map(Number);
                return "generate" in given ? Array.from({ length: (last - first) / by + 1 }, (_, i) => first + i * by) : row.map(Number);
            });
            if (this.now !== undefined) this.now.sets.set(keyword + set, labels);
            else this.assembly.set(set, [...(this.assembly.get(set) ?? []), { instance: given.instance, labels }]);
        } else if (keyword === "*surface") this.now?.surfaces.set(given.name, data);
    }

    moved(place) {
        const [shift, rotation] = this.now.placed;
        const shifted = shift === undefined ? place : plus(place, shift);
        return rotation === undefined ? shifted : turned(shifted, rotation.slice(0, 3), rotation.slice(3, 6), rotation[6]);
    }

    /** The places of the nodes of "Instance.SET" or of a set of the assembly. */
    nodes(name) {
        const [instance, set] = name.split(".");
        const parts = set === undefined ? this.assembly.get(name) : [{ instance, labels: this.instances.get(instance).sets.get("*nset" + set) }];
        return parts.flatMap((part) => part.labels.map((label) => this.instances.get(part.instance).nodes.get(label)));
    }

    /** The faces of "Instance.SURFACE": corners, middle, and the direction out of the body or of the side. */
    faces(name) {
        const [instance, surface] = name.split(".");
        const { nodes, elements, sets, surfaces } = this.instances.get(instance);
        return surfaces.get(surface).flatMap(([set, side]) =>
            sets.get("*elset" + set).map((label) => {
                const element = elements.get(label);
                const isShell = side.endsWith("POS") || side.endsWith("NEG");
                const corners = isShell ? element.nodes.length : element.nodes.length === 10 ? 4 : 8;
                const all = element.nodes.slice(0, corners).map((node) => nodes.get(node));
                const own = isShell ? all : solidFaces[corners][side].map((corner) => all[corner]);
                const normal = unit(cross(plus(own[1], own[0], -1), plus(own[2], own[0], -1)));
                const sign = isShell ? (side === "SPOS" ? 1 : -1) : Math.sign(dot(normal, plus(mean(own), mean(all), -1)));
                return { corners: own, centre: mean(own), out: normal.map((x) => x * sign) };
            }),
        );
    }

    /** All places of a set of nodes or of a surface's corners. */
    places(name) {
        const [instance, set] = name.split(".");
        const isSurface = set !== undefined && this.instances.get(instance).surfaces.has(set);
        return isSurface ? this.faces(name).flatMap((face) => face.corners) : this.nodes(name);
    }
}

/** Projects places as the camera of a page does that looks as its address says. */
export class Camera {
    constructor(view, width, height) {
        Object.assign(this, { width, height, eye: view.slice(0, 3), target: view.slice(3, 6), seen: view[9] });
        this.forward = unit(plus(this.target, this.eye, -1));
        this.right = unit(cross(this.forward, view.slice(6, 9)));
        this.up = cross(this.right, this.forward);
    }

    /** Pixels from the left and from the top. */
    at(place) {
        const arm = plus(place, this.eye, -1);
        // The camera sees 40 degrees from its lower to its upper edge.
        const height = Math.tan(Math.PI / 9) * (this.seen ?? dot(arm, this.forward));
        const scale = this.height / 2 / height;
        return { x: this.width / 2 + scale * dot(arm, this.right), y: this.height / 2 - scale * dot(arm, this.up) };
    }
}
