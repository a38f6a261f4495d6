#!/bin/sh
# An editor of rich text that changes nothing but saves the file in its own way:
#   resave.sh soffice|abiword|pandoc FILE
set -e
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
case $1 in
    soffice)
        soffice "-env:UserInstallation=file://$folder/profile" --headless --convert-to rtf \
            --outdir "$folder" "$2" >"$folder/log" 2>&1
        ;;
    abiword) abiword --to=rtf --to-name="$folder/mtext.rtf" "$2" >"$folder/log" 2>&1 ;;
    pandoc) pandoc -s -f rtf -t rtf -o "$folder/mtext.rtf" "$2" ;;
esac
cat "$folder/mtext.rtf" >"$2"
