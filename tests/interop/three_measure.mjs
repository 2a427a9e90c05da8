// What three shows of .glb and .usda files at each frame. Its one argument is a JSON file of jobs: a file, the frames
// with their seconds, and where to write.
import { readFileSync, writeFileSync } from 'node:fs';
import { AnimationMixer, LoopOnce } from 'three';
import { GLTFLoader } from 'three/examples/jsm/loaders/GLTFLoader.js';
import { USDLoader } from 'three/examples/jsm/loaders/USDLoader.js';

function rows(matrix) {
  const e = matrix.elements;
  return [0, 1, 2, 3].map((row) => [e[row], e[row + 4], e[row + 8], e[row + 12]]);
}

async function loadGltf(file) {
  const bytes = readFileSync(file);
  const data = bytes.buffer.slice(bytes.byteOffset, bytes.byteOffset + bytes.byteLength);
  const loaded = await new GLTFLoader().parseAsync(data, '');
  const named = new Map();
  for (const [object, place] of loaded.parser.associations) {
    if (place.nodes !== undefined && object.isObject3D) named.set(`layer${place.nodes}`, object);
  }
  return { root: loaded.scene, clips: loaded.animations, named };
}

// Prims have names that stand once in a file.
function loadUsd(file) {
  const root = new USDLoader().parse(readFileSync(file, 'utf8'));
  const named = new Map();
  root.traverse((object) => named.set(object.name, object));
  return { root, clips: root.animations, named };
}

function measure(loaded, frames) {
  const mixer = new AnimationMixer(loaded.root);
  const actions = loaded.clips.map((clip) => mixer.clipAction(clip));
  const measured = {};
  for (const { label, time } of frames) {
    for (const action of actions) {
      action.reset();
      action.setLoop(LoopOnce);
      action.clampWhenFinished = true;
      action.play();
    }
    mixer.setTime(time);
    loaded.root.updateMatrixWorld(true);
    const layers = {};
    for (const [name, object] of loaded.named) {
      layers[name] = { world: rows(object.matrixWorld) };
      if (object.isCamera) {
        object.updateProjectionMatrix();
        layers[name].projection = rows(object.projectionMatrix);
      }
    }
    measured[label] = layers;
  }
  return measured;
}

for (const job of JSON.parse(readFileSync(process.argv[2], 'utf8'))) {
  const loaded = job.file.endsWith('.usda') ? loadUsd(job.file) : await loadGltf(job.file);
  writeFileSync(job.output, JSON.stringify({ frames: measure(loaded, job.frames) }));
}
