#ifndef QRX_MODEL_FILE_MDF_SCHEMAFRAME_H
#define QRX_MODEL_FILE_MDF_SCHEMAFRAME_H

/// The frame of a model file; members that hold records are added from the classes.
inline constexpr char mdf_kSchemaFrame[] = R"({
  "$schema": "https://json-schema.org/draft/2020-12/schema",
  "title": "QRX model file",
  "description": "A model store on disk: everything that a keyword deck is written from. Comments are allowed.",
  "type": "object",
  "additionalProperties": false,
  "required": ["format", "models"],
  "properties": {
    "$schema": {"description": "where an editor finds this schema; not looked at", "type": "string"},
    "format": {"description": "what this file is", "const": "qrx-model/1"},
    "parameters": {
      "description": "Short names for what a study varies; a column of its table is one of them, or a pointer.",
      "type": "object",
      "propertyNames": {"minLength": 1, "pattern": "^[^/]", "not": {"const": "name"}},
      "additionalProperties": {
        "anyOf": [
          {"$ref": "#/$defs/POINTERS"},
          {
            "type": "object",
            "additionalProperties": false,
            "required": ["pointers"],
            "properties": {
              "pointers": {"description": "what it stands for", "$ref": "#/$defs/POINTERS"},
              "unit": {"description": "for people", "type": "string"},
              "limits": {"description": "what its numbers may be: \"> 0, <= 20\", or \"0.5 .. 20\" with both ends", "type": "string"},
              "description": {"description": "for people", "type": "string"}
            }
          }
        ]
      }
    },
    "models": {
      "description": "Models by name. A deck is written from the only one, of several from \"Default Model\" or the one that is chosen.",
      "type": "object",
      "minProperties": 1,
      "propertyNames": {"$ref": "#/$defs/NAME"},
      "additionalProperties": {"$ref": "#/$defs/MODEL"}
    }
  },
  "$defs": {
    "NAME": {
      "description": "A name that can stand in a deck.",
      "type": "string", "minLength": 1, "maxLength": 80, "pattern": "^[^\"\\u0000-\\u001f\\u007f]*$"
    },
    "POINTER": {
      "description": "A JSON pointer to a value of this file.",
      "type": "string", "pattern": "^/models/"
    },
    "POINTERS": {
      "description": "One place, or several that get the same value.",
      "anyOf": [{"$ref": "#/$defs/POINTER"}, {"type": "array", "items": {"$ref": "#/$defs/POINTER"}, "minItems": 1}]
    },
    "LINE": {
      "description": "A text that can stand on one line of a deck.",
      "type": "string", "pattern": "^[^\\u0000-\\u001f\\u007f]*$"
    },
    "TEXT": {
      "description": "Deck text, with whatever keywords are in it: a string as it stands, or an array of strings, each of which becomes a line.",
      "anyOf": [{"type": "string"}, {"type": "array", "items": {"type": "string"}}]
    },
    "REFERENCE": {
      "description": "The name of another object of the model; empty for none.",
      "type": "string", "maxLength": 80, "pattern": "^[^\"\\u0000-\\u001f\\u007f]*$"
    },
    "INT": {"description": "A whole number of 32 bits.", "type": "integer", "minimum": -2147483648, "maximum": 2147483647},
    "TRIPLE": {"description": "Three numbers: x, y and z.", "type": "array", "items": {"type": "number"}, "minItems": 3, "maxItems": 3},
    "COMPLEX": {
      "description": "A complex number: real and imaginary part, or an object. In the form POLAR real is the magnitude and imag the phase in degrees.",
      "anyOf": [
        {"type": "array", "items": {"type": "number"}, "minItems": 2, "maxItems": 2},
        {
          "type": "object",
          "additionalProperties": false,
          "properties": {
            "form": {"description": "how the two numbers are to be read", "$ref": "#/$defs/omi_complex::FormEnm", "default": "RECTANGULAR"},
            "real": {"description": "real part, or magnitude", "type": "number", "default": 0},
            "imag": {"description": "imaginary part, or phase", "type": "number", "default": 0}
          }
        }
      ]
    },
    "TABLE": {
      "description": "Rows of numbers, all of one length.",
      "type": "array", "items": {"type": "array", "items": {"type": "number"}}
    },
    "LABELS": {
      "description": "User labels in order, or a range of them.",
      "anyOf": [
        {"type": "array", "items": {"type": "integer", "minimum": 1, "maximum": 2147483647}},
        {
          "type": "object",
          "additionalProperties": false,
          "required": ["from", "to"],
          "properties": {
            "from": {"description": "first label", "type": "integer", "minimum": 1},
            "to": {"description": "no label is above it", "type": "integer", "minimum": 1},
            "by": {"description": "from one label to the next", "type": "integer", "minimum": 1, "default": 1}
          }
        }
      ]
    },
    "FACETS": {
      "description": "Element label and face: S1 to S6 on solids and plane elements, SPOS and SNEG on shells, END1 and END2 on lines, or the facet's id from 0 (6 is the double side of a shell).",
      "type": "array",
      "items": {
        "type": "array", "minItems": 2, "maxItems": 2,
        "prefixItems": [{"type": "integer", "minimum": 1}, {"type": ["string", "integer"]}]
      }
    },
    "REGION": {
      "description": "A set of the assembly (\"SET\") or of an instance (\"INSTANCE.SET\"), as an object where a name has a dot; null for none.",
      "anyOf": [
        {"type": ["string", "null"]},
        {
          "type": "object",
          "additionalProperties": false,
          "required": ["set"],
          "properties": {
            "instance": {"description": "the instance that has the set", "$ref": "#/$defs/NAME"},
            "set": {"description": "the set", "$ref": "#/$defs/NAME"}
          }
        }
      ]
    },
    "REGIONS": {
      "description": "A region, or an array of node sets, whose nodes are taken together, each once.",
      "anyOf": [{"$ref": "#/$defs/REGION"}, {"type": "array", "items": {"$ref": "#/$defs/REGION"}, "minItems": 1}]
    },
    "NODES": {
      "description": "User labels, and for each three coordinates (single precision).",
      "type": "object",
      "additionalProperties": false,
      "required": ["labels", "coordinates"],
      "properties": {
        "labels": {"description": "labels that differ", "$ref": "#/$defs/LABELS"},
        "coordinates": {"description": "x, y and z of each node: lengths", "type": "array", "items": {"$ref": "#/$defs/TRIPLE"}}
      }
    },
    "ELEMENTS": {
      "description": "Elements of one type, each with a row of node labels. In the assembly's mesh an end may be a text: instance, dot, label.",
      "type": "object",
      "additionalProperties": false,
      "required": ["type", "labels", "connectivity"],
      "properties": {
        "type": {"description": "the element type, as the deck says it", "$ref": "#/$defs/NAME"},
        "labels": {"description": "labels that differ in the whole mesh", "$ref": "#/$defs/LABELS"},
        "connectivity": {
          "description": "the nodes of each element",
          "type": "array",
          "items": {"type": "array", "items": {"type": ["integer", "string"]}, "minItems": 1}
        },
        "controls": {"description": "element controls", "$ref": "#/$defs/bme_ElemCtrlParams"}
      }
    },
    "MESH": {
      "description": "Nodes, elements and sets. Elements find their nodes by label, sets their members. Or a mesher's file, whose cells and groups they are.",
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "file": {"description": "a mesher's file (MSH, UNV, MED, VTU, VTK, STL), relative to the model file; it takes the place of nodes and elements", "type": "string", "minLength": 1},
        "part": {"description": "the mesh to take of a file with several", "type": "string"},
        "scale": {"description": "coordinates of the file are multiplied by it", "type": "number", "exclusiveMinimum": 0, "default": 1},
        "elementTypes": {"description": "element types by kind of cell, such as tetra10; null: such cells make no elements", "type": "object", "additionalProperties": {"anyOf": [{"$ref": "#/$defs/NAME"}, {"type": "null"}]}},
        "surfaceElements": {"description": "what surface cells become; shells where there are no solids", "type": "string"},
        "groups": {"description": "names of sets by group, or by group, '@' and dimension; null leaves the group out", "type": "object", "additionalProperties": {"anyOf": [{"$ref": "#/$defs/NAME"}, {"type": "null"}]}},
        "groupArrays": {"description": "integer arrays of cells whose values become groups NAME_VALUE, in formats without groups", "type": "array", "items": {"type": "string"}},
        "controls": {"description": "element controls by element type, for a file's elements", "type": "object", "additionalProperties": {"$ref": "#/$defs/bme_ElemCtrlParams"}},
        "nodes": {"description": "the nodes in the order of the deck", "$ref": "#/$defs/NODES"},
        "elements": {"description": "the elements type by type, in the order of the deck", "type": "array", "items": {"$ref": "#/$defs/ELEMENTS"}},
        "sets": {"description": "node sets, element sets and surfaces", "type": "array", "items": {"$ref": "#/$defs/SET"}}
      }
    },
    "MEMBERS": {
      "description": "Members of a set of the assembly in one instance; without an instance, in the assembly's own mesh.",
      "type": "object",
      "additionalProperties": false,
      "properties": {
        "instance": {"description": "the instance that they lie in", "$ref": "#/$defs/NAME"},
        "labels": {"description": "nodes or elements", "$ref": "#/$defs/LABELS"},
        "facets": {"description": "faces of elements", "$ref": "#/$defs/FACETS"}
      }
    }
  }
})";

#endif
