#!/bin/sh
# demo.sh BUILD FOLDER: draws the demonstration into FOLDER with the examples built in BUILD, and says where to look.
set -eu
if [ $# -ne 2 ]; then
    echo "usage: demo.sh BUILD FOLDER" >&2
    exit 2
fi
exec python3 "$(dirname "$0")/demo.py" "$1/curvelab/curvelab" "$2"
