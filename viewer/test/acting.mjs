// What acts in the examples, read off their models by hand: where, in which steps, and which way.
// nodes: arrows begin there; faces: arrows point at them against their normals; held: cones and bars at the nodes;
// on: what is tinted or joined by lines.
const x = [1, 0, 0];
const y = [0, 1, 0];
const z = [0, 0, 1];
const down = [0, 0, -1];
const move = [1, 2, 3];
const all = [1, 2, 3, 4, 5, 6];

export const acting = {
    bracket: {
        steps: ["Initial", "Tighten", "Bend", "Modes", "Shake", "Stop"],
        objects: [
            { name: "loads/Weight on the pad", in: "Tighten Bend Modes Shake Stop", faces: "BRACKET-1.LOADED-FACE" },
            { name: "loads/Push", in: "Bend", nodes: "BRACKET-1.TIP", along: down },
            { name: "loads/Pull", in: "Bend", nodes: "BRACKET-1.TIP", along: x },
            { name: "loads/Shaker", in: "Shake", nodes: "BRACKET-1.TIP", along: z },
            { name: "loads/Jolt", in: "Stop", nodes: "BRACKET-1.TIP", along: y },
            { name: "boundaryConditions/Bolted", held: "BRACKET-1.BOLTS_NODES", freedoms: move },
            { name: "boundaryConditions/Wall", held: "BRACKET-1.CLAMPED-FACE_NODES", freedoms: [2] },
        ],
    },
    bolted_joint: {
        steps: ["Initial", "Tighten", "Draw", "Warm", "Cool"],
        objects: [
            { name: "loads/Nut", in: "Tighten Draw Warm Cool", nodes: "Point-1.REF", along: down },
            { name: "boundaryConditions/Pull", in: "Draw Warm Cool", nodes: "Upper.END", along: x },
            { name: "boundaryConditions/Grip", held: "Lower.END", freedoms: all },
            { name: "boundaryConditions/Stop", held: "Stop-1.NODES", freedoms: all },
            { name: "boundaryConditions/Head", held: "Point-1.REF", freedoms: [4, 5, 6] },
            { name: "boundaryConditions/Hot end", in: "Warm", on: ["Lower.END"] },
            { name: "fields/Room", on: ["JOINT"] },
            { name: "interactions/Air", in: "Warm Cool", on: ["Upper.TOP"] },
            { name: "interactions/Hot blast", in: "Warm", on: ["Stud-1.SHANK"] },
            { name: "interactions/Faces", in: "Tighten Draw Warm Cool", on: ["Lower.TOP", "Upper.BOTTOM"] },
            { name: "interactions/Stop", in: "Draw Warm Cool", on: ["Stop-1.LEFT", "Upper.TIP"] },
            { name: "constraints/Weld", on: ["Lower.BOTTOM", "Stud-1.FOOT"] },
            { name: "constraints/Head", on: ["Point-1.REF", "Stud-1.HEAD"] },
        ],
    },
    thermo_mechanical: {
        steps: ["Initial", "Heat", "Preload", "Pressure", "Modes"],
        objects: [
            { name: "loads/Weight", in: "Heat Preload Pressure Modes", everywhere: true, along: down },
            { name: "loads/Bolt left", in: "Preload Pressure Modes", bolt: "Bolt-1.CUT" },
            { name: "loads/Bolt right", in: "Preload Pressure Modes", bolt: "Bolt-2.CUT" },
            { name: "loads/Process", in: "Pressure Modes", faces: "Sleeve-1.SIDE" },
            { name: "boundaryConditions/Feet", held: "FEET", freedoms: all },
            { name: "boundaryConditions/Floor", in: "Initial Heat", held: "Sleeve-1.BOTTOM", freedoms: [3] },
            { name: "boundaryConditions/Floor", in: "Preload Pressure Modes", nodes: "Sleeve-1.BOTTOM", along: down },
            { name: "boundaryConditions/Guide", in: "Initial Heat Preload", held: "Bar-1.END", freedoms: [1, 2] },
            { name: "fields/Oven", on: ["OVEN"] },
            { name: "constraints/Left", on: ["Bar-1.LEFT", "Bolt-1.TOP"] },
            { name: "constraints/Middle", on: ["Bar-1.MIDDLE", "Sleeve-1.TOP"] },
            { name: "constraints/Right", on: ["Bar-1.RIGHT", "Bolt-2.TOP"] },
        ],
    },
    assembly: { steps: ["Initial", "Settle"], objects: [] },
    bonded_blocks: {
        steps: ["Initial", "Press"],
        objects: [
            { name: "loads/Weight", in: "Press", faces: "BLOCKS-1.TOP" },
            { name: "boundaryConditions/Foot", held: "BLOCKS-1.FOOT_NODES", freedoms: move },
            { name: "constraints/Bond", on: ["BLOCKS-1.BELOW", "BLOCKS-1.ABOVE"] },
        ],
    },
    perforated_plate: {
        steps: ["Initial", "Load"],
        objects: [
            { name: "loads/Wind", in: "Load", faces: "PLATE-1.plate_SPOS" },
            { name: "boundaryConditions/Drawn", in: "Load", nodes: "PLATE-1.PULLED", along: x },
            { name: "boundaryConditions/Held", held: "PLATE-1.CLAMPED", freedoms: all },
        ],
    },
    plate_study: {
        steps: ["Initial", "Load"],
        objects: [
            { name: "loads/Wind", in: "Load", faces: "PLATE-1.plate_SPOS" },
            { name: "boundaryConditions/Drawn", in: "Load", nodes: "PLATE-1.PULLED", along: x },
            { name: "boundaryConditions/Held", held: "PLATE-1.CLAMPED", freedoms: all },
        ],
    },
    materials: { steps: [], objects: [] },
};

/** How large marks are, as parts of the diagonal of what is shown. */
export const sizes = { force: 0.11, motion: 0.0825, pressure: 0.077, gravity: 0.165, bolt: 0.11, cone: 0.0165, bar: 0.02475 };
/** At most so many marks show one object. */
export const mostMarks = 120;
