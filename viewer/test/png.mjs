// Reads pictures as Chromium writes them (8 bits, RGB or RGBA, not interlaced), and compares them.
import { inflateSync } from "node:zlib";

export function readPng(file) {
    let place = 8;
    let width = 0;
    let height = 0;
    let channels = 0;
    const parts = [];
    while (place < file.length) {
        const length = file.readUInt32BE(place);
        const type = file.toString("latin1", place + 4, place + 8);
        const data = file.subarray(place + 8, place + 8 + length);
        if (type === "IHDR") {
            [width, height] = [data.readUInt32BE(0), data.readUInt32BE(4)];
            channels = { 2: 3, 6: 4 }[data[9]];
            if (data[8] !== 8 || channels === undefined || data[12] !== 0) throw new Error("a PNG of another form");
        }
        if (type === "IDAT") parts.push(data);
        place += length + 12;
    }
    return { width, height, rgb: unfiltered(inflateSync(Buffer.concat(parts)), width, height, channels) };
}

function unfiltered(raw, width, height, channels) {
    const stride = width * channels;
    const lines = new Uint8Array(height * stride);
    for (let y = 0; y < height; ++y) {
        const filter = raw[y * (stride + 1)];
        const from = y * (stride + 1) + 1;
        const to = y * stride;
        for (let x = 0; x < stride; ++x) {
            const left = x < channels ? 0 : lines[to + x - channels];
            const above = y === 0 ? 0 : lines[to + x - stride];
            let guess = 0;
            if (filter === 1) guess = left;
            else if (filter === 2) guess = above;
            else if (filter === 3) guess = (left + above) >> 1;
            else if (filter === 4) guess = paeth(left, above, y === 0 || x < channels ? 0 : lines[to + x - stride - channels]);
            lines[to + x] = raw[from + x] + guess;
        }
    }
    const rgb = new Uint8Array(width * height * 3);
    for (let i = 0; i < width * height; ++i) for (let k = 0; k < 3; ++k) rgb[3 * i + k] = lines[channels * i + k];
    return rgb;
}

function paeth(a, b, c) {
    const pa = Math.abs(b - c);
    const pb = Math.abs(a - c);
    const pc = Math.abs(a + b - 2 * c);
    return pa <= pb && pa <= pc ? a : pb <= pc ? b : c;
}

/** Means over squares of so many pixels: edges that are smoothed otherwise don't count, a missing arrow does. */
const square = 8;

/** The largest difference of a square's mean colour between two pictures of one size, 0 to 255, and where. */
export function difference(a, b) {
    if (a.width !== b.width || a.height !== b.height) return { most: 255, x: 0, y: 0 };
    let worst = { most: 0, x: 0, y: 0 };
    for (let y = 0; y + square <= a.height; y += square) {
        for (let x = 0; x + square <= a.width; x += square) {
            for (let k = 0; k < 3; ++k) {
                let sum = 0;
                for (let j = 0; j < square; ++j) {
                    for (let i = 0; i < square; ++i) {
                        const place = 3 * ((y + j) * a.width + x + i) + k;
                        sum += a.rgb[place] - b.rgb[place];
                    }
                }
                const most = Math.abs(sum) / (square * square);
                if (most > worst.most) worst = { most, x, y };
            }
        }
    }
    return worst;
}

/** How many different colours there are, counted coarsely. */
export function colours(picture) {
    const seen = new Set();
    for (let i = 0; i < picture.rgb.length; i += 3) {
        seen.add((picture.rgb[i] >> 4) * 256 + (picture.rgb[i + 1] >> 4) * 16 + (picture.rgb[i + 2] >> 4));
    }
    return seen.size;
}
