"""The keys by which a second import finds what the first one made."""


def keys_of(layers):
    """A key for each layer: the names above it and its own.

    Layers of one path count in their order, so that the key of a layer stays
    when other layers come or go elsewhere.
    """
    seen = {}
    keys = []
    for layer in layers:
        names = [link.name.replace("\\", "\\\\").replace("/", "\\/")
                 for link in reversed(layer.chain())]
        path = ("camera:" if layer.is_camera else "null:") + "/".join(names)
        seen[path] = seen.get(path, 0) + 1
        keys.append(f"{path}#{seen[path]}")
    return keys
