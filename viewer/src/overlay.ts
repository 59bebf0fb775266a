// Over the picture, in two dimensions: the names of what acts, with lines to where it acts, and the axes.
import { Vector3 } from "three";
import type { Stage } from "./stage";

/** A text that points at one of some places of the model. */
export interface Label {
    object: number;
    text: string;
    colour: string;
    places: Vector3[];
}

interface Box {
    x: number;
    y: number;
    width: number;
    height: number;
}

interface Drawn extends Box {
    label: Label;
}

/** So many names stand on the picture at most; what is selected comes first. */
const mostLabels = 24;
const rowHeight = 18;
const reach = 16;
const axisColours = { light: ["#c01818", "#157a15", "#1c48c8"], dark: ["#ff8080", "#6fd06f", "#8fb0ff"] };

function overlap(a: Box, b: Box): boolean {
    return a.x < b.x + b.width && b.x < a.x + a.width && a.y < b.y + b.height && b.y < a.y + a.height;
}

export class Overlay {
    private readonly canvas: HTMLCanvasElement;
    private labels: Label[] = [];
    private drawn: Drawn[] = [];
    private selected = -1;
    private named = true;

    constructor(private readonly stage: Stage) {
        this.canvas = document.createElement("canvas");
        this.canvas.id = "overlay";
        this.canvas.setAttribute("aria-hidden", "true");
        stage.canvas.after(this.canvas);
        stage.overlay = this;
    }

    setLabels(labels: Label[], selected: number): void {
        this.labels = labels;
        this.selected = selected;
        this.stage.draw();
    }

    showNames(on: boolean): void {
        this.named = on;
        this.stage.draw();
    }

    /** The object whose name stands at a point of the picture. */
    objectAt(x: number, y: number): number | undefined {
        return this.drawn.find((box) => overlap(box, { x, y, width: 0, height: 0 }))?.label.object;
    }

    /** Draws all of it anew, for the camera as it is, or onto another picture of the same size. */
    draw(onto?: CanvasRenderingContext2D): void {
        const { clientWidth: width, clientHeight: height } = this.stage.canvas;
        const ratio = Math.min(window.devicePixelRatio, 2);
        const context = onto ?? this.canvas.getContext("2d");
        if (context === null || width === 0 || height === 0) return;
        if (onto === undefined) Object.assign(this.canvas, { width: Math.round(width * ratio), height: Math.round(height * ratio) });
        context.setTransform(ratio, 0, 0, ratio, 0, 0);
        context.font = "12px system-ui, sans-serif";
        context.textBaseline = "middle";
        this.drawn = [];
        const axes = { x: 0, y: height - 88, width: 88, height: 88 };
        if (this.named) this.drawLabels(context, { x: 0, y: 0, width, height }, axes);
        this.drawAxes(context, axes);
    }

    private drawLabels(context: CanvasRenderingContext2D, picture: Box, axes: Box): void {
        const centre = this.projected(this.stage.box.getCenter(new Vector3()), picture) ?? { x: picture.width / 2, y: picture.height / 2 };
        const first = this.labels.filter((label) => label.object === this.selected);
        const others = this.labels.filter((label) => label.object !== this.selected);
        const taken: Box[] = [axes];
        const drawing: (() => void)[] = [];
        for (const label of [...first, ...others]) {
            if (this.drawn.length >= mostLabels) break;
            const seen = label.places.flatMap((place) => {
                const at = this.stage.isCutAway(place) ? undefined : this.projected(place, picture);
                return at !== undefined && overlap({ ...at, width: 0, height: 0 }, picture) ? [at] : [];
            });
            // Names stand around the model: that of its places which lies farthest out.
            const out = (at: { x: number; y: number }) => Math.hypot(at.x - centre.x, at.y - centre.y);
            const end = seen.reduce<{ x: number; y: number } | undefined>((best, at) => (best === undefined || out(at) > out(best) ? at : best), undefined);
            if (end === undefined) continue;
            const width = context.measureText(label.text).width + 10;
            const box = this.freePlace(end, end.x < centre.x, width, picture, taken);
            if (box === undefined) continue;
            taken.push(box);
            this.drawn.push({ ...box, label });
            drawing.push(() => this.drawLabel(context, label, box, end));
        }
        for (const draw of drawing) draw();
    }

    /** A place beside a point where nothing stands yet: near its own height, on either side. */
    private freePlace(end: { x: number; y: number }, leftward: boolean, width: number, picture: Box, taken: Box[]): Box | undefined {
        if (width > picture.width) return undefined;
        for (let i = 0; i < 24; ++i) {
            const rows = (i % 2 === 0 ? -1 : 1) * Math.ceil(i / 2);
            for (const left of [leftward, !leftward]) {
                const x = Math.min(Math.max(left ? end.x - reach - width : end.x + reach, 0), picture.width - width);
                const y = Math.min(Math.max(end.y - rowHeight / 2 + rows * (rowHeight + 3), 0), picture.height - rowHeight);
                const box = { x, y, width, height: rowHeight };
                const hidesEnd = overlap(box, { x: end.x - 3, y: end.y - 3, width: 6, height: 6 });
                if (!hidesEnd && !taken.some((other) => overlap(box, other))) return box;
            }
        }
        return undefined;
    }

    private drawLabel(context: CanvasRenderingContext2D, label: Label, box: Box, end: { x: number; y: number }): void {
        const style = getComputedStyle(this.canvas);
        const x = end.x < box.x ? box.x : end.x > box.x + box.width ? box.x + box.width : end.x;
        const y = end.y < box.y ? box.y : end.y > box.y + box.height ? box.y + box.height : end.y;
        context.strokeStyle = label.colour;
        context.fillStyle = label.colour;
        context.lineWidth = 1.2;
        context.beginPath();
        context.moveTo(end.x, end.y);
        context.lineTo(x, y);
        context.stroke();
        context.beginPath();
        context.arc(end.x, end.y, 2.2, 0, 2 * Math.PI);
        context.fill();
        context.globalAlpha = 0.92;
        context.fillStyle = style.getPropertyValue("--panel");
        context.fillRect(box.x, box.y, box.width, box.height);
        context.globalAlpha = 1;
        context.lineWidth = label.object === this.selected ? 2.4 : 1.2;
        context.strokeRect(box.x + 0.5, box.y + 0.5, box.width - 1, box.height - 1);
        context.fillStyle = style.getPropertyValue("--text");
        context.fillText(label.text, box.x + 5, box.y + box.height / 2 + 0.5);
    }

    /** The directions of x, y and z, in the corner; those that point at the eye stand before the others. */
    private drawAxes(context: CanvasRenderingContext2D, box: Box): void {
        const dark = window.matchMedia("(prefers-color-scheme: dark)").matches;
        const colours = axisColours[dark ? "dark" : "light"];
        const turn = this.stage.camera.quaternion.clone().invert();
        const centre = { x: box.x + box.width / 2, y: box.y + box.height / 2 };
        const axes = (["x", "y", "z"] as const).map((name, i) => {
            const direction = new Vector3().setComponent(i, 1).applyQuaternion(turn);
            return { name, direction, colour: colours[i] ?? "" };
        });
        axes.sort((a, b) => a.direction.z - b.direction.z);
        context.textAlign = "center";
        for (const { name, direction, colour } of axes) {
            const end = { x: centre.x + 26 * direction.x, y: centre.y - 26 * direction.y };
            context.strokeStyle = colour;
            context.fillStyle = colour;
            context.lineWidth = 2.5;
            context.beginPath();
            context.moveTo(centre.x, centre.y);
            context.lineTo(end.x, end.y);
            context.stroke();
            const length = Math.hypot(direction.x, direction.y);
            const out = length < 0.25 ? { x: 0.7, y: 0.7 } : { x: direction.x / length, y: -direction.y / length };
            context.fillText(name, end.x + 9 * out.x, end.y + 9 * out.y);
        }
        context.textAlign = "start";
    }

    /** Where a place of the model lies on the picture; nothing behind the eye. */
    private projected(place: Vector3, picture: Box): { x: number; y: number } | undefined {
        const { camera } = this.stage;
        const seen = place.clone().applyMatrix4(camera.matrixWorldInverse);
        if (seen.z >= 0 && !this.stage.parallelView) return undefined;
        seen.applyMatrix4(camera.projectionMatrix);
        return { x: ((seen.x + 1) / 2) * picture.width, y: ((1 - seen.y) / 2) * picture.height };
    }
}
