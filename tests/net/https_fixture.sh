#!/bin/sh
# usage: https_fixture.sh start|stop WORKDIR SRCDIR
# start: a throw-away test CA, a second CA with the same name, a server certificate for
#        localhost (DNS and IP names) signed by the first, fingerprints of all three, and the
#        loopback HTTPS server in the background with its output in files (ctest must not wait
#        on it). stop: ends that server.
set -eu
cmd=$1; d=$2; src=${3:-}
case $cmd in
start)
  src=$(cd "$src" && pwd)
  if [ -f "$d/pid" ]; then kill "$(cat "$d/pid")" 2>/dev/null || true; fi
  rm -rf "$d"; mkdir -p "$d"; cd "$d"
  for ca in ca other; do
    openssl req -x509 -newkey rsa:2048 -nodes -keyout $ca.key -out $ca.pem -days 2 -subj "/CN=OESDK Test Root" \
      -addext basicConstraints=critical,CA:TRUE -addext keyUsage=critical,keyCertSign,cRLSign 2>/dev/null
    openssl x509 -in $ca.pem -outform DER -out $ca.der
  done
  openssl req -newkey rsa:2048 -nodes -keyout srv.key -out srv.csr -subj "/CN=localhost" 2>/dev/null
  printf 'subjectAltName=DNS:localhost,IP:127.0.0.1\nbasicConstraints=critical,CA:FALSE\nkeyUsage=critical,digitalSignature,keyEncipherment\nextendedKeyUsage=serverAuth\n' > srv.ext
  openssl x509 -req -in srv.csr -CA ca.pem -CAkey ca.key -CAcreateserial -out srv.pem -days 2 -extfile srv.ext 2>/dev/null
  openssl x509 -in srv.pem -outform DER -out srv.der
  for c in ca other srv; do
    openssl x509 -in $c.pem -noout -fingerprint -sha1 | sed 's/.*=//; s/://g' > $c.sha1
  done
  python3 "$src/ofx_https_server.py" --cert srv.pem --key srv.key --reply "$src/reply.ofx" \
    --port-file port --request-log requests.log --max-requests 400 --lifetime 900 \
    >server.out 2>server.err </dev/null &
  echo $! > pid
  i=0; while [ ! -s port ] && [ $i -lt 100 ]; do sleep 0.1; i=$((i+1)); done
  if [ ! -s port ]; then echo "https server did not start:"; cat server.err; exit 1; fi
  echo "https server pid $(cat pid) port $(cat port)" ;;
stop)
  if [ -f "$d/pid" ]; then kill "$(cat "$d/pid")" 2>/dev/null || true; rm -f "$d/pid"; fi ;;
esac
