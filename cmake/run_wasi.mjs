// Runs a WebAssembly program that was built for WASI: node run_wasi.mjs PROGRAM ARGUMENTS...
import {readFileSync} from 'node:fs';
import {WASI} from 'node:wasi';

const [program, ...rest] = process.argv.slice(2);
const wasi = new WASI({version: 'preview1', args: [program, ...rest], env: process.env, preopens: {'/': '/'}});
const module = await WebAssembly.compile(readFileSync(program));
const imports = {wasi_snapshot_preview1: wasi.wasiImport};
process.exitCode = wasi.start(await WebAssembly.instantiate(module, imports));
