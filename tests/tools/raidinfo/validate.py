"""Validates documents, one a line on standard input, against the schema that the command prints."""

import json
import subprocess
import sys

import jsonschema

schema = json.loads(subprocess.run(sys.argv[1:], check=True, capture_output=True).stdout)
jsonschema.Draft202012Validator.check_schema(schema)
validator = jsonschema.Draft202012Validator(
    schema, format_checker=jsonschema.FormatChecker()
)
count = 0
for line in sys.stdin:
    if line.strip():
        validator.validate(json.loads(line))
        count += 1
print(count, "valid")
