// Runs a WebAssembly program: node run-wasi.mjs PROGRAM ARGUMENT...
import { readFile } from 'node:fs/promises';
import { WASI } from 'node:wasi';

const [program, ...args] = process.argv.slice(2);
const wasi = new WASI({ version: 'preview1', args: [program, ...args], env: process.env, preopens: { '/': '/' } });
const noExceptions = () => { throw new Error('an exception was thrown, which this system cannot catch'); };
const env = { __cxa_allocate_exception: noExceptions, __cxa_throw: noExceptions };
const module = await WebAssembly.compile(await readFile(program));
process.exitCode = wasi.start(await WebAssembly.instantiate(module, { wasi_snapshot_preview1: wasi.wasiImport, env }));
