"""The list of contents, in the form of CycloneDX 1.4: every artifact and what each carries."""

import json
import uuid
import zipfile
from pathlib import Path

from .artifacts import GROUP
from .sums import sha256

_MAVEN = Path("/usr/share/maven-repo")


def of(artifacts, group, version):
    """The list of these artifacts, whose files lie below the folder `group`, as JSON."""
    carried = {library for artifact in artifacts for library in artifact.carries}
    components = [_artifact(artifact, group, version) for artifact in artifacts]
    components += sorted(map(_library, carried), key=lambda component: component["bom-ref"])
    root = {"type": "library", "bom-ref": f"quorvane@{version}", "group": GROUP, "name": "quorvane",
            "version": version}
    edges = [_edge(_purl(artifact, version),
                   [_purl_of(GROUP, name, version) for name in artifact.uses]
                   + [_library(library)["bom-ref"] for library in artifact.carries])
             for artifact in artifacts]
    edges.append(_edge(root["bom-ref"], [_purl(artifact, version) for artifact in artifacts]))
    bom = {"bomFormat": "CycloneDX", "specVersion": "1.4", "version": 1,
           "metadata": {"component": root}, "components": components, "dependencies": edges}
    # The number of a list is its own: made from what it lists, it is the same when made twice.
    bom["serialNumber"] = uuid.uuid5(uuid.NAMESPACE_URL, json.dumps(bom, sort_keys=True)).urn
    return json.dumps(bom, indent=2, sort_keys=True) + "\n"


def _artifact(artifact, group, version):
    file = artifact.main_file(group / artifact.name / version, version)
    component = {"type": "library", "bom-ref": _purl(artifact, version), "group": GROUP,
                 "name": artifact.name, "version": version, "description": artifact.purpose,
                 "hashes": _hashes(file.read_bytes()), "purl": _purl(artifact, version)}
    with zipfile.ZipFile(file) as archive:
        natives = sorted(name for name in archive.namelist() if "libquorvane." in name)
        parts = [{"type": "file", "bom-ref": f"{_purl(artifact, version)}#{name}", "name": name,
                  "hashes": _hashes(archive.read(name))} for name in natives]
    if parts:
        component["components"] = parts
    return component


def _library(library):
    """A library of others, in the version that the distribution's own repository tells."""
    places = _MAVEN.joinpath(*library.group.split("."), library.name)
    version = next(path.name for path in sorted(places.iterdir()) if path.name != "debian")
    purl = _purl_of(library.group, library.name, version)
    return {"type": "library", "bom-ref": purl, "group": library.group, "name": library.name,
            "version": version, "hashes": _hashes(Path(library.jar).read_bytes()),
            "licenses": [{"license": {"id": library.licence}}], "purl": purl}


def _purl(artifact, version):
    kind = "" if artifact.packaging == "jar" else f"?type={artifact.packaging}"
    return _purl_of(GROUP, artifact.name, version) + kind


def _purl_of(group, name, version):
    return f"pkg:maven/{group}/{name}@{version}"


def _hashes(data):
    return [{"alg": "SHA-256", "content": sha256(data)}]


def _edge(source, targets):
    return {"ref": source, "dependsOn": sorted(targets)}
