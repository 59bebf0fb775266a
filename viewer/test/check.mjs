// Types, style and unit tests of the page's code.
import { spawnSync } from "node:child_process";
import { dirname, join } from "node:path";
import { fileURLToPath } from "node:url";

const viewer = join(dirname(fileURLToPath(import.meta.url)), "..");
for (const script of [["node_modules/typescript/bin/tsc", "--noEmit"], ["node_modules/eslint/bin/eslint.js", "."], ["test/unit.mjs"]]) {
    const run = spawnSync(process.execPath, script, { cwd: viewer, stdio: "inherit" });
    if (run.status !== 0) process.exit(run.status ?? 1);
}
