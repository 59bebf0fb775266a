// The picture: camera, light, section plane; drawn again only when something changed.
import {
    AmbientLight,
    Box3,
    type Camera,
    Color,
    DirectionalLight,
    Group,
    OrthographicCamera,
    PerspectiveCamera,
    Plane,
    Scene,
    Sphere,
    Vector3,
    WebGLRenderer,
} from "three";
import { OrbitControls } from "three/examples/jsm/controls/OrbitControls.js";
import { at } from "./data";
import type { Overlay } from "./overlay";

/** The tangent of half the angle that the perspective camera sees. */
const half = Math.tan((40 * Math.PI) / 360);

export const views: { name: string; label: string; eye: [number, number, number]; up: [number, number, number] }[] = [
    { name: "Slanting", label: "slanting", eye: [1, -1.6, 1], up: [0, 0, 1] },
    { name: "+x", label: "from +x", eye: [1, 0, 0], up: [0, 0, 1] },
    { name: "−x", label: "from −x", eye: [-1, 0, 0], up: [0, 0, 1] },
    { name: "+y", label: "from +y", eye: [0, 1, 0], up: [0, 0, 1] },
    { name: "−y", label: "from −y", eye: [0, -1, 0], up: [0, 0, 1] },
    { name: "+z", label: "from +z", eye: [0, 0, 1], up: [0, 1, 0] },
    { name: "−z", label: "from −z", eye: [0, 0, -1], up: [0, 1, 0] },
];

export class Stage {
    readonly scene = new Scene();
    /** What fit() looks at. */
    readonly content = new Group();
    readonly box = new Box3(new Vector3(-0.5, -0.5, -0.5), new Vector3(0.5, 0.5, 0.5));
    /** Where marks stand. */
    readonly marked = new Box3();
    /** Drawn over each picture. */
    overlay: Overlay | undefined;
    private readonly renderer: WebGLRenderer;
    private readonly perspective = new PerspectiveCamera(40, 1, 0.1, 100);
    private readonly parallel = new OrthographicCamera(-1, 1, 1, -1, 0.1, 100);
    private readonly light = new DirectionalLight(0xffffff, 2.1);
    private controls: OrbitControls;
    private isParallel = false;
    private pending = false;
    private readonly plane = new Plane(new Vector3(1, 0, 0), 0);

    constructor(
        readonly canvas: HTMLCanvasElement,
        private readonly moved: () => void,
    ) {
        this.renderer = new WebGLRenderer({ canvas, antialias: true });
        this.renderer.setPixelRatio(Math.min(window.devicePixelRatio, 2));
        this.scene.add(this.content, new AmbientLight(0xffffff, 1.1), this.light, this.light.target);
        this.perspective.up.set(0, 0, 1);
        this.parallel.up.set(0, 0, 1);
        this.controls = this.controlsFor(this.perspective);
        const dark = window.matchMedia("(prefers-color-scheme: dark)");
        const paint = () => {
            const stage = canvas.parentElement ?? canvas;
            this.scene.background = new Color(getComputedStyle(stage).backgroundColor);
            this.draw();
        };
        dark.addEventListener("change", paint);
        paint();
        new ResizeObserver(() => this.resize()).observe(canvas);
        this.resize();
    }

    get camera(): PerspectiveCamera | OrthographicCamera {
        return this.isParallel ? this.parallel : this.perspective;
    }

    get parallelView(): boolean {
        return this.isParallel;
    }

    private controlsFor(camera: Camera): OrbitControls {
        const controls = new OrbitControls(camera, this.canvas);
        controls.addEventListener("change", () => {
            this.draw();
            this.moved();
        });
        controls.zoomToCursor = true;
        return controls;
    }

    resize(): void {
        const { clientWidth: width, clientHeight: height } = this.canvas;
        if (width === 0 || height === 0) return;
        this.renderer.setSize(width, height, false);
        this.perspective.aspect = width / height;
        this.perspective.updateProjectionMatrix();
        this.shapeParallel();
        this.draw();
    }

    /** Parallel views see as much as perspective ones do at the target. */
    private shapeParallel(): void {
        const height = this.distance() * half;
        const aspect = this.perspective.aspect;
        Object.assign(this.parallel, { left: -height * aspect, right: height * aspect, top: height, bottom: -height });
        this.parallel.updateProjectionMatrix();
    }

    private distance(): number {
        return this.camera.position.distanceTo(this.controls.target);
    }

    draw(): void {
        if (this.pending) return;
        this.pending = true;
        requestAnimationFrame(() => this.drawNow());
    }

    drawNow(): void {
        this.pending = false;
        const camera = this.camera;
        const sphere = this.box.getBoundingSphere(new Sphere());
        const reach = camera.position.distanceTo(sphere.center);
        const radius = Math.max(sphere.radius * 1.6, 1e-6);
        camera.near = this.isParallel ? reach - 20 * radius : Math.max(reach - radius, (reach + radius) / 2000);
        camera.far = reach + radius;
        camera.updateProjectionMatrix();
        // Light comes over the left shoulder.
        const offset = new Vector3(-0.35, 0.55, 1).applyQuaternion(camera.quaternion);
        this.light.position.copy(this.controls.target).add(offset);
        this.light.target.position.copy(this.controls.target);
        this.renderer.render(this.scene, camera);
        this.overlay?.draw();
    }

    /** Takes the scene's content for what views are fitted to. */
    measure(box: Box3): void {
        if (!box.isEmpty()) this.box.copy(box);
    }

    get size(): number {
        return Math.max(this.box.getSize(new Vector3()).length(), 1e-9);
    }

    /** Looks at a box, or at all with its marks, from where the eye is, or along a direction. */
    fit(box: Box3 = this.box.clone().union(this.marked), eye?: Vector3, up?: Vector3): void {
        const sphere = box.getBoundingSphere(new Sphere());
        const direction = eye?.clone() ?? this.camera.position.clone().sub(this.controls.target);
        if (direction.length() === 0) direction.set(1, -1.6, 1);
        const distance = Math.max(this.distanceTo(box, sphere.center, direction, up ?? this.camera.up), this.size * 0.06);
        this.controls.target.copy(sphere.center);
        if (up !== undefined) {
            this.camera.up.copy(up);
            this.renewControls();
        }
        this.camera.position.copy(sphere.center).add(direction.setLength(distance));
        this.parallel.zoom = 1;
        this.camera.lookAt(this.controls.target);
        this.shapeParallel();
        this.controls.update();
        this.draw();
        this.moved();
    }

    /** How far off the middle of a box shows all of it, with some room. */
    private distanceTo(box: Box3, middle: Vector3, direction: Vector3, up: Vector3): number {
        const forward = direction.clone().normalize();
        const right = new Vector3().crossVectors(up, forward).normalize();
        const top = new Vector3().crossVectors(forward, right);
        let distance = 0;
        for (let corner = 0; corner < 8; ++corner) {
            const arm = new Vector3(corner & 1 ? box.max.x : box.min.x, corner & 2 ? box.max.y : box.min.y, corner & 4 ? box.max.z : box.min.z);
            arm.sub(middle);
            const aside = Math.max(Math.abs(arm.dot(right)) / this.perspective.aspect, Math.abs(arm.dot(top))) / half;
            distance = Math.max(distance, 1.15 * aside + arm.dot(forward));
        }
        return distance;
    }

    /** Orbiting turns about what was up when the controls were made. */
    private renewControls(): void {
        const target = this.controls.target.clone();
        this.controls.dispose();
        this.controls = this.controlsFor(this.camera);
        this.controls.target.copy(target);
    }

    setParallel(on: boolean): void {
        if (on === this.isParallel) return;
        const from = this.camera;
        const distance = on ? this.distance() : this.distance() / this.parallel.zoom;
        const direction = from.position.clone().sub(this.controls.target).setLength(distance);
        this.isParallel = on;
        this.camera.up.copy(from.up);
        this.camera.position.copy(this.controls.target).add(direction);
        this.parallel.zoom = 1;
        this.renewControls();
        this.shapeParallel();
        this.controls.update();
        this.draw();
        this.moved();
    }

    /** Turns by angles about the vertical and the horizontal axis of the picture. */
    turn(across: number, along: number): void {
        const offset = this.camera.position.clone().sub(this.controls.target);
        const up = this.camera.up.clone().normalize();
        offset.applyAxisAngle(up, across);
        const side = new Vector3().crossVectors(up, offset).normalize();
        const lifted = offset.clone().applyAxisAngle(side, along);
        if (Math.abs(lifted.clone().normalize().dot(up)) < 0.999) offset.copy(lifted);
        this.camera.position.copy(this.controls.target).add(offset);
        this.controls.update();
        this.draw();
        this.moved();
    }

    /** Moves by parts of the picture's height. */
    move(right: number, up: number): void {
        const height = (2 * this.distance() * half) / (this.isParallel ? this.parallel.zoom : 1);
        const shift = new Vector3(right * height, up * height, 0).applyQuaternion(this.camera.quaternion);
        this.camera.position.add(shift);
        this.controls.target.add(shift);
        this.controls.update();
        this.draw();
        this.moved();
    }

    zoom(factor: number): void {
        if (this.isParallel) {
            this.parallel.zoom *= factor;
            this.parallel.updateProjectionMatrix();
        } else {
            const offset = this.camera.position.clone().sub(this.controls.target);
            this.camera.position.copy(this.controls.target).add(offset.divideScalar(factor));
        }
        this.controls.update();
        this.draw();
        this.moved();
    }

    get view(): number[] {
        const { position, up } = this.camera;
        const seen = this.isParallel ? [this.distance() / this.parallel.zoom] : [];
        return [...position.toArray(), ...this.controls.target.toArray(), ...up.toArray(), ...seen];
    }

    set view(values: number[]) {
        this.setParallel(values.length === 10);
        this.camera.up.fromArray(values, 6);
        this.renewControls();
        this.camera.position.fromArray(values, 0);
        this.controls.target.fromArray(values, 3);
        this.parallel.zoom = values.length === 10 ? this.distance() / at(values, 9) : 1;
        this.shapeParallel();
        this.controls.update();
        this.draw();
    }

    /** Cuts away what lies beyond a part (0 to 1) of the box along an axis; no axis for nothing. */
    cut(axis: "x" | "y" | "z" | "", part: number, flipped: boolean): void {
        if (axis === "") {
            this.renderer.clippingPlanes = [];
        } else {
            const place = this.box.min[axis] + part * (this.box.max[axis] - this.box.min[axis]);
            this.plane.normal.set(0, 0, 0);
            this.plane.normal[axis] = flipped ? 1 : -1;
            this.plane.constant = flipped ? -place : place;
            this.renderer.clippingPlanes = [this.plane];
        }
        this.draw();
    }

    isCutAway(place: Vector3): boolean {
        return this.renderer.clippingPlanes.some((plane: Plane) => plane.distanceToPoint(place) < 0);
    }

    /** The picture as it is seen, names and axes included. */
    picture(): Promise<Blob | null> {
        this.drawNow();
        const whole = document.createElement("canvas");
        Object.assign(whole, { width: this.canvas.width, height: this.canvas.height });
        const context = whole.getContext("2d");
        context?.drawImage(this.canvas, 0, 0);
        if (context !== null) this.overlay?.draw(context);
        return new Promise((done) => whole.toBlob(done, "image/png"));
    }
}
