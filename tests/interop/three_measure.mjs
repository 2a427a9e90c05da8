// What three shows of .glb and .usda files at each frame. It runs in a page.
import { AnimationMixer, LoopOnce } from 'three';
import { GLTFLoader } from 'three/addons/loaders/GLTFLoader.js';
import { USDLoader } from 'three/addons/loaders/USDLoader.js';

function rows(matrix) {
  const e = matrix.elements;
  return [0, 1, 2, 3].map((row) => [e[row], e[row + 4], e[row + 8], e[row + 12]]);
}

async function loadGltf(url) {
  const loaded = await new GLTFLoader().loadAsync(url);
  const named = new Map();
  for (const [object, place] of loaded.parser.associations) {
    if (place.nodes !== undefined && object.isObject3D) named.set(`layer${place.nodes}`, object);
  }
  return { root: loaded.scene, clips: loaded.animations, named };
}

// Prims have names that stand once in a file.
async function loadUsd(url) {
  const root = await new USDLoader().loadAsync(url);
  const named = new Map();
  root.traverse((object) => named.set(object.name, object));
  return { root, clips: root.animations, named };
}

// A mixer plays no times below 0: there all are moved up.
function framesOf(loaded, frames) {
  const up = Math.max(0, -frames[0].time);
  for (const clip of loaded.clips) {
    for (const track of clip.tracks) track.shift(up);
    clip.resetDuration();
  }
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
    mixer.setTime(time + up);
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

export async function measure({ url, usd, frames }) {
  const loaded = await (usd ? loadUsd(url) : loadGltf(url));
  return { frames: framesOf(loaded, frames) };
}
