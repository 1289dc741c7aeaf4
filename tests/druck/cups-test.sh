#!/usr/bin/env bash
# Prints through a real print system: starts a private cupsd, adds a cups-pdf queue "PDF", runs
# the given print dialog test against it, and checks the PDF that cups-pdf writes.
#   cups-test.sh PATH/TO/tst_formdrucken cupsDruck
# Exit 77 (skipped) when this machine cannot run it: not root (the cups-pdf backend runs only as
# root), or cups / cups-pdf / poppler-utils missing (scripts/deps.sh test installs them).
set -euo pipefail

[ $# -ge 1 ] || { echo "usage: cups-test.sh PROGRAM [ARGUMENTS]" >&2; exit 2; }
warteschlange=PDF

ueberspringe() { echo "SKIP: $*" >&2; exit 77; }
[ "$(id -u)" -eq 0 ] || ueberspringe "needs root for the cups-pdf backend"
for werkzeug in cupsd lpadmin lpstat pdftotext pdfinfo; do
  command -v "$werkzeug" >/dev/null 2>&1 || ueberspringe "$werkzeug is not installed"
done
[ -x /usr/lib/cups/backend/cups-pdf ] || ueberspringe "printer-driver-cups-pdf is not installed"

# A cupsd of our own, in a folder of its own and reachable only through its socket, so that a
# system cupsd (if any) and /etc/cups stay untouched. The folder must be readable by the
# filters, which run as user lp. /tmp keeps the socket path short.
ordner=$(mktemp -d /tmp/pradilon-cups.XXXXXX)
chmod 755 "$ordner"
mkdir -p "$ordner"/conf "$ordner"/spool/tmp "$ordner"/cache "$ordner"/state "$ordner"/log
export CUPS_SERVER=$ordner/cups.sock
cupsd_pid=
marke=$ordner/start

# cups-pdf writes into "Out" of its configuration, ${HOME}/PDF of the job's user by default.
home=$(getent passwd "$(id -un)" | cut -d: -f6)
ausgabe=$(sed -n 's/^[[:space:]]*Out[[:space:]]\+//p' /etc/cups/cups-pdf.conf 2>/dev/null | tail -n 1)
ausgabe=${ausgabe:-'${HOME}/PDF'}
ausgabe=${ausgabe//'${HOME}'/$home}
ausgabe=${ausgabe//'${USER}'/$(id -un)}
ausgabe_neu=false
[ -d "$ausgabe" ] || ausgabe_neu=true

aufraeumen() {
  set +e
  if [ -n "$cupsd_pid" ] && kill -0 "$cupsd_pid" 2>/dev/null; then
    lpadmin -x "$warteschlange" 2>/dev/null
    kill "$cupsd_pid"
    for _ in $(seq 50); do kill -0 "$cupsd_pid" 2>/dev/null || break; sleep 0.1; done
    kill -9 "$cupsd_pid" 2>/dev/null
    wait "$cupsd_pid" 2>/dev/null
  fi
  if [ -d "$ausgabe" ]; then
    find "$ausgabe" -maxdepth 1 -name '*.pdf' -newer "$marke" -delete 2>/dev/null
    $ausgabe_neu && rmdir "$ausgabe" 2>/dev/null
  fi
  rm -rf "$ordner"
}
trap aufraeumen EXIT

cat >"$ordner/conf/cupsd.conf" <<EOF
Listen $ordner/cups.sock
LogLevel warn
WebInterface No
Browsing No
DefaultShared No
<Policy default>
  JobPrivateAccess default
  JobPrivateValues default
  SubscriptionPrivateAccess default
  SubscriptionPrivateValues default
  <Limit All>
    Order deny,allow
  </Limit>
</Policy>
EOF
cat >"$ordner/conf/cups-files.conf" <<EOF
ServerRoot $ordner/conf
RequestRoot $ordner/spool
TempDir $ordner/spool/tmp
CacheDir $ordner/cache
StateDir $ordner/state
ErrorLog $ordner/log/error_log
AccessLog $ordner/log/access_log
PageLog $ordner/log/page_log
Sandboxing Relaxed
FileDevice No
EOF
touch "$marke"

fehler() {
  echo "FAIL: $*" >&2
  [ -f "$ordner/log/error_log" ] && tail -n 20 "$ordner/log/error_log" >&2
  exit 1
}

# Waits up to $1 tenths of a second for the command to succeed.
warte() {
  local zehntel=$1; shift
  for _ in $(seq "$zehntel"); do "$@" && return 0; sleep 0.1; done
  return 1
}

cupsd -f -c "$ordner/conf/cupsd.conf" -s "$ordner/conf/cups-files.conf" </dev/null &
cupsd_pid=$!
laeuft() { lpstat -r 2>/dev/null | grep -q 'scheduler is running'; }
warte 100 laeuft || fehler "cupsd did not answer within 10 s"

# -m names the driver the way the print system lists it; older lists only know the file.
lpadmin -p "$warteschlange" -v cups-pdf:/ -m lsb/usr/cups-pdf/CUPS-PDF_opt.ppd -E 2>/dev/null \
  || lpadmin -p "$warteschlange" -v cups-pdf:/ -P /usr/share/ppd/cups-pdf/CUPS-PDF_opt.ppd -E \
  || fehler "cannot add the queue"
# Text stays text on the way through PostScript.
lpadmin -p "$warteschlange" -o pdftops-renderer-default=pdftocairo

PRADILON_CUPS_DRUCKER=$warteschlange QT_QPA_PLATFORM=${QT_QPA_PLATFORM:-offscreen} \
  timeout 30 "$@" || fehler "the print dialog test failed"

erledigt() { [ -z "$(lpstat -o "$warteschlange" 2>/dev/null)" ]; }
warte 300 erledigt || fehler "the job did not finish within 30 s"
lpstat -W completed -o "$warteschlange" | grep -q . || fehler "no job was completed"

neue_pdf() { find "$ausgabe" -maxdepth 1 -name '*.pdf' -newer "$marke" 2>/dev/null | head -n 1; }
hat_pdf() { [ -n "$(neue_pdf)" ]; }
warte 50 hat_pdf || fehler "no PDF arrived in $ausgabe"
pdf=$(neue_pdf)

text=$(pdftotext "$pdf" -)
seiten=$(pdfinfo "$pdf" | sed -n 's/^Pages:[[:space:]]*//p')
for erwartet in "Adressverzeichnis aller Ministranten" "Bauer" "Hauptstraße 1" "Oberministranten" \
                "Ministrantenplan vom 01.01.2027 bis 01.01.2027" "Freitag, den 01.01.2027, 9.30 Uhr:" \
                "Vorname0 Bauer"; do
  grep -qF "$erwartet" <<<"$text" || fehler "\"$erwartet\" missing from the printed PDF"
done
[ "$seiten" = 2 ] || fehler "expected 2 pages, got $seiten"
echo "printed through cups: $pdf, $seiten pages"
