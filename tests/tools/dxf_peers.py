#!/usr/bin/python3
"""Independent readers and writers of DXF for the DXF plug-in tests (Debian's python3-ezdxf, GDAL's ogr2ogr).

  dxf_peers.py count FILE            ezdxf's audit and the entities by kind and layer as ezdxf and GDAL read them
  dxf_peers.py ezdxf VERSION IN OUT  the entities of IN written again by ezdxf as a drawing of VERSION (R12, R2000, R2018)
  dxf_peers.py gdal IN OUT           the entities of IN written again by ogr2ogr's DXF driver

Kinds: point, line (LINE, LWPOLYLINE, 2D and 3D POLYLINE), arc, circle, text (TEXT, MTEXT), face (3DFACE),
insert (INSERT). Output of count: one JSON object {"errors": n, "ezdxf": {...}, "gdal": {...}}.
"""
import collections
import csv
import io
import json
import subprocess
import sys

import ezdxf

EZDXF_KINDS = {"POINT": "point", "LINE": "line", "LWPOLYLINE": "line", "POLYLINE": "line", "ARC": "arc",
               "CIRCLE": "circle", "TEXT": "text", "MTEXT": "text", "3DFACE": "face", "INSERT": "insert"}
# GDAL's SubClasses field, most specific class first; attributes are texts of an insert, not entities.
GDAL_KINDS = [("AcDbAttribute", None), ("AcDbArc", "arc"), ("AcDbCircle", "circle"), ("AcDbPoint", "point"),
              ("AcDbMText", "text"), ("AcDbText", "text"), ("AcDbFace", "face"), ("AcDbPolyline", "line"),
              ("AcDb3dPolyline", "line"), ("AcDb2dPolyline", "line"), ("AcDbLine", "line"),
              ("AcDbBlockReference", "insert")]


def ezdxf_counts(doc):
    counts = collections.Counter()
    for entity in doc.modelspace():
        kind = EZDXF_KINDS.get(entity.dxftype(), entity.dxftype())
        counts[kind + "|" + entity.dxf.layer] += 1
    return dict(counts)


def gdal_counts(path):
    sql = "SELECT Layer, SubClasses, COUNT(*) AS n FROM entities GROUP BY Layer, SubClasses"
    table = subprocess.run(["ogr2ogr", "-f", "CSV", "/vsistdout/", path, "-dialect", "sqlite", "-sql", sql],
                           check=True, capture_output=True, text=True).stdout
    counts = collections.Counter()
    for row in csv.DictReader(io.StringIO(table)):
        kind = next((kind for marker, kind in GDAL_KINDS if marker in row["SubClasses"]), row["SubClasses"])
        if kind is not None:
            counts[kind + "|" + row["Layer"]] += int(row["n"])
    return dict(counts)


def count(path):
    doc = ezdxf.readfile(path)
    auditor = doc.audit()
    for error in auditor.errors:
        print(error, file=sys.stderr)
    print(json.dumps(sort_keys=True, obj={"errors": len(auditor.errors), "ezdxf": ezdxf_counts(doc), "gdal": gdal_counts(path)}))


def rewrite_with_ezdxf(version, source_path, target_path):
    source = ezdxf.readfile(source_path)
    target = ezdxf.new(version)
    for layer in source.layers:
        if layer.dxf.name not in target.layers:
            target.layers.add(layer.dxf.name, color=abs(layer.dxf.color))
    msp = target.modelspace()
    r12 = version == "R12"
    for entity in source.modelspace():
        kind = entity.dxftype()
        attribs = {"layer": entity.dxf.layer}
        if kind == "POINT":
            msp.add_point(entity.dxf.location, dxfattribs=attribs)
        elif kind == "LWPOLYLINE":
            points = list(entity.get_points("xyb"))
            attribs["elevation"] = (0, 0, entity.dxf.elevation) if r12 else entity.dxf.elevation
            if r12:
                line = msp.add_polyline2d([(x, y) for x, y, _ in points], dxfattribs=attribs, close=entity.closed)
                for vertex, (_, _, bulge) in zip(line.vertices, points):
                    vertex.dxf.bulge = bulge
            else:
                msp.add_lwpolyline(points, format="xyb", close=entity.closed, dxfattribs=attribs)
        elif kind == "POLYLINE":
            msp.add_polyline3d([v.dxf.location for v in entity.vertices], close=entity.is_closed, dxfattribs=attribs)
        elif kind == "ARC":
            msp.add_arc(entity.dxf.center, entity.dxf.radius, entity.dxf.start_angle, entity.dxf.end_angle,
                        dxfattribs=attribs)
        elif kind == "CIRCLE":
            msp.add_circle(entity.dxf.center, entity.dxf.radius, dxfattribs=attribs)
        elif kind in ("TEXT", "MTEXT"):
            text = entity.dxf.text if kind == "TEXT" else entity.plain_text()
            height = entity.dxf.height if kind == "TEXT" else entity.dxf.char_height
            attribs["insert"] = entity.dxf.insert
            if r12 or kind == "TEXT":
                msp.add_text(text.replace("\n", " "), dxfattribs=dict(attribs, height=height))
            else:
                msp.add_mtext(text, dxfattribs=dict(attribs, char_height=height))
        elif kind == "3DFACE":
            msp.add_3dface([entity.dxf.vtx0, entity.dxf.vtx1, entity.dxf.vtx2, entity.dxf.vtx3], dxfattribs=attribs)
    target.saveas(target_path)


def rewrite_with_gdal(source_path, target_path):
    # The attributes of the point inserts are texts of their points, not entities of their own.
    subprocess.run(["ogr2ogr", "-f", "DXF", target_path, source_path, "-where", "SubClasses NOT LIKE '%AcDbAttribute%'"],
                   check=True, capture_output=True)


if __name__ == "__main__":
    command = sys.argv[1]
    if command == "count":
        count(sys.argv[2])
    elif command == "ezdxf":
        rewrite_with_ezdxf(sys.argv[2], sys.argv[3], sys.argv[4])
    elif command == "gdal":
        rewrite_with_gdal(sys.argv[2], sys.argv[3])
    else:
        sys.exit("unknown command " + command)
