#!/bin/sh
# A user listens with tvxcim inside a private network namespace while an
# interface's IPv4 address is replaced: the subscription switches the change
# detector on, and the replacement arrives as one Talvex_KernelIPChangedIndication
# within one 30-second detection cycle. Needs root for the namespace; skipped
# (77) elsewhere. Usage: check_kernel_ip_change.sh <tvxcim> [emulator]
set -u
tvxcim=$1
emulator=${2:-}
if [ "$(id -u)" != 0 ] || ! command -v ip >/dev/null; then
    echo "skipped: needs root and iproute2 for a private network namespace"
    exit 77
fi
ns=tvxlisten$$
out=$(mktemp)
cleanup() { ip netns del "$ns" 2>/dev/null; rm -f "$out"; }
trap cleanup EXIT
ip netns add "$ns" || exit 77
ip -n "$ns" link add tvxa type veth peer name tvxb &&
    ip -n "$ns" link set tvxa up &&
    ip -n "$ns" addr add 10.77.0.1/24 dev tvxa || { echo "cannot set up the namespace"; exit 1; }

# 40 s: the first cycle runs as the provider loads, the next one 30 s later.
ip netns exec "$ns" $emulator "$tvxcim" listen --seconds 40 >"$out" 2>&1 &
listener=$!
sleep 5
ip -n "$ns" addr del 10.77.0.1/24 dev tvxa && ip -n "$ns" addr add 10.77.0.2/24 dev tvxa || exit 1
wait "$listener" || { echo "tvxcim listen failed:"; cat "$out"; exit 1; }

count=$(grep -c '^instance of Talvex_KernelIPChangedIndication' "$out")
if [ "$count" != 1 ] || ! grep -q 'SourceInstanceHost = "10.77.0.2";' "$out"; then
    echo "expected one change indication for the new address 10.77.0.2, got:"
    cat "$out"
    exit 1
fi
echo "the replaced address arrived as one indication"
