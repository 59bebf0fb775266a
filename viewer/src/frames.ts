// Local systems: what their directions are at a place.
import { Matrix4, Quaternion, Vector3 } from "three";
import type { Datum, Instance } from "./data";

export type Axes = [Vector3, Vector3, Vector3];

export const globalAxes = (): Axes => [new Vector3(1, 0, 0), new Vector3(0, 1, 0), new Vector3(0, 0, 1)];

/** Directions 1, 2 and 3 of a system at a place: radius, tangent and axis of a cylinder, and so on. */
export function axesAt(datum: Datum, place: Vector3): Axes {
    const [x, y, z] = datum.axes.map((axis) => new Vector3(...axis)) as Axes;
    if (datum.system === "RECTANGULAR") return [x, y, z];
    const arm = place.clone().sub(new Vector3(...datum.origin));
    const across = arm.clone().addScaledVector(z, -arm.dot(z));
    if (across.length() < 1e-12 * (1 + arm.length())) return [x, y, z];
    if (datum.system === "CYLINDRICAL") {
        const radius = across.normalize();
        return [radius, new Vector3().crossVectors(z, radius), z];
    }
    // Radius, circle around the axis, and meridian.
    const radius = arm.normalize();
    const circle = new Vector3().crossVectors(z, radius).normalize();
    return [radius, circle, new Vector3().crossVectors(radius, circle)];
}

/** The same, turned by an angle in degrees about one of them. */
export function turnedAxes(axes: Axes, axis: number, degrees: number): Axes {
    const about = axes[axis as 0 | 1 | 2];
    const turn = new Quaternion().setFromAxisAngle(about, (degrees * Math.PI) / 180);
    return axes.map((direction) => direction.clone().applyQuaternion(turn)) as Axes;
}

export function matrixOf(instance: Instance): Matrix4 {
    const m = instance.placement as [number, number, number, number, number, number, number, number, number, number, number, number];
    return new Matrix4().set(...m, 0, 0, 0, 1);
}
