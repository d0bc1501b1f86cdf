#!/usr/bin/env bash
# The server and its clients over TLS, with certificates made here: what connects, and what does not.
#
#   tls.sh ZELCTL ZELSIM MAKE_CERTIFICATES
set -euo pipefail

zelctl=$1
zelsim=$2
make_certificates=$3
# shellcheck source=common.sh
. "$(dirname "$0")/common.sh"
if ! command -v openssl > /dev/null; then
    echo "SKIPPED: openssl is missing, no certificates can be made"
    exit 77
fi

cd "$scratch"
unset ZELREMOTE_TLS_CA ZELREMOTE_TLS_CERTIFICATE ZELREMOTE_TLS_KEY
"$make_certificates" set > fingerprint
fingerprint=$(cat fingerprint)
[ -s set/server.pem ] && [ -s set/client.key ] || fail "no set of certificates"
[ "$(stat -c %a set/ca.key)" = 600 ] || fail "others may read the key of the authority"

# other NAME SUBJECT_ALTERNATIVE FROM TO: one more certificate of the same authority.
other() {
    cp set/server.key "$1.key"
    openssl req -new -key "$1.key" -subj "/CN=$1" -out "$1.csr"
    touch "$1.index"
    rm -rf new && mkdir new
    printf '%s\n' '[ca]' 'default_ca=one' '[one]' "database=$1.index" 'new_certs_dir=new' \
        'rand_serial=yes' 'default_md=sha256' 'policy=any' 'x509_extensions=ext' '[any]' \
        'commonName=supplied' '[ext]' "subjectAltName=$2" 'extendedKeyUsage=serverAuth' > "$1.cnf"
    openssl ca -batch -config "$1.cnf" -cert set/ca.pem -keyfile set/ca.key -in "$1.csr" \
        -out "$1.pem" -startdate "$3" -enddate "$4" 2> "$1.openssl.log" || fail "openssl ca"
}
other expired DNS:localhost,IP:127.0.0.1 20200101000000Z 20200201000000Z
other early DNS:localhost,IP:127.0.0.1 21000101000000Z 21010101000000Z
other elsewhere DNS:elsewhere.example 20200101000000Z 20491231000000Z
"$make_certificates" strangers > /dev/null

"$zelsim" --pty --link "$scratch/instrument" > simulator.log 2>&1 &
simulator=$!
until [ -s simulator.log ]; do sleep 0.05; done

start_server() { # OPTIONS...
    : > server.log
    "$zelctl" --home home serve --serial "$scratch/instrument" --baud 57600 \
        --listen 127.0.0.1:0 "$@" > server.log 2> server.errors.log &
    server=$!
    until grep -q '^instrument' server.log; do
        kill -0 "$server" 2> /dev/null || fail "the server ended"
        sleep 0.05
    done
    port=$(sed -n 's/^listening 127.0.0.1://p' server.log)
}
stop_server() {
    kill "$server"
    status=0
    wait "$server" || status=$?
    server=
    [ "$status" -eq 0 ] || fail "the server ended with status $status"
    [ "$(tail -1 server.log)" = closed ] || fail "the server did not say closed"
}
# client STATUS TEXT [FINGERPRINT]: one connection, its end and what standard error says.
client() {
    status=0
    "$zelctl" --home client --connect "tls:127.0.0.1:$port${3:+,$3}" info \
        > client.log 2> client.errors.log || status=$?
    [ "$status" -eq "$1" ] || fail "status $status where $1 was expected ($2)"
    if [ "$1" -eq 0 ]; then
        grep -q "^Identity: $2" client.log || fail "no identity came"
    else
        grep -q "$2" client.errors.log || fail "\"$2\" was not told"
        [ ! -s client.log ] || fail "something was shown of a connection that failed"
    fi
}

start_server --tls-certificate set/server.pem --tls-key set/server.key
client 0 Marlow "$fingerprint"
client 0 Marlow "$(tr 'A-F' 'a-f' <<< "${fingerprint//:/}")"
# One of 256 certificates has a fingerprint that begins with zeros.
other=00
[ "${fingerprint:0:2}" != "$other" ] || other=11
client 1 "shows another certificate, with the fingerprint" "$other${fingerprint:2}"
client 1 "of no authority that this computer knows"
export ZELREMOTE_TLS_CA=set/ca.pem
client 0 Marlow
export ZELREMOTE_TLS_CA=strangers/ca.pem
client 1 "of no authority that this computer knows"
export ZELREMOTE_TLS_CA=none.pem
client 1 "none.pem holds no certificate in PEM form"
unset ZELREMOTE_TLS_CA
echo "fingerprint, authority, neither"

# A client in the clear gets nothing, and the next one works.
status=0
"$zelctl" --home client --connect "tcp:127.0.0.1:$port" info > client.log 2> client.errors.log ||
    status=$?
[ "$status" -eq 1 ] || fail "a client in the clear: status $status"
grep -q "^refused 127.0.0.1" server.log || fail "a client in the clear was not refused"
client 0 Marlow "$fingerprint"
# Who does not prove himself does not put out the client at work.
mkfifo lines
"$zelctl" --home panel --connect "tls:127.0.0.1:$port,$fingerprint" panel < lines \
    > panel.log 2>&1 &
panel=$!
exec 6> lines
printf 'connect\nshow isConnected\n' >&6
until grep -q true panel.log; do
    kill -0 "$panel" 2> /dev/null || fail "the panel ended"
    sleep 0.05
done
exec 5<> "/dev/tcp/127.0.0.1/$port"
printf 'GET / HTTP/1.0\r\n\r\n' >&5
cat <&5 > scanner.log
exec 5>&-
printf 'click FrequencyButton\nshow isConnected\ndisconnect\nquit\n' >&6
exec 6>&-
wait "$panel" || fail "the panel's status"
[ "$(grep -c true panel.log)" -eq 2 ] || fail "the client at work lost its connection"
echo "a newcomer without TLS leaves the client at work"
stop_server

export ZELREMOTE_TLS_CA=set/ca.pem
for case in "expired:has expired on 2020-02-01" "early:is valid only from 2100-01-01" \
    "elsewhere:is not for 127.0.0.1"; do
    start_server --tls-certificate "${case%%:*}.pem" --tls-key "${case%%:*}.key"
    client 1 "${case#*:}"
    stop_server
    echo "$case"
done

start_server --tls-certificate set/server.pem --tls-key set/server.key --tls-clients set/ca.pem
client 1 "only clients that show a certificate"
export ZELREMOTE_TLS_CERTIFICATE=strangers/client.pem ZELREMOTE_TLS_KEY=strangers/client.key
client 1 "only clients that show a certificate"
export ZELREMOTE_TLS_CERTIFICATE=set/client.pem ZELREMOTE_TLS_KEY=none.key
client 1 "none.key cannot be read"
export ZELREMOTE_TLS_KEY=set/client.key
client 0 Marlow
stop_server
[ "$(grep -c '^client 127' server.log)" -eq 1 ] || fail "a client without a certificate was let in"
echo "clients with and without a certificate"

status=0
"$zelctl" --home home serve --serial "$scratch/instrument" --tls-certificate set/server.key \
    --tls-key set/server.key > server.log 2> server.errors.log || status=$?
[ "$status" -eq 1 ] || fail "a certificate that is none: status $status"
grep -q "set/server.key holds no certificate in PEM form" server.errors.log || fail "no words"
echo "a certificate that is none"
