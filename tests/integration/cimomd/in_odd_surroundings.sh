#!/bin/sh
# Runs a command where it sees interfaces, addresses, routes and mounted file systems that few
# machines have all at once, and that nobody else sees. Exits with 77 where that is not allowed.

set -eu

if [ "${1:-}" != --inside ]; then
    if ! unshare --net --mount true 2>/dev/null; then
        echo "namespaces cannot be made here"
        exit 77
    fi
    exec unshare --net --mount "$0" --inside "$@"
fi
shift

# The kernel shows a network's interfaces in a sysfs that was mounted inside of it.
mount -t sysfs none /sys

ip link set lo up
ip link add port0 type veth peer name port1
ip link set port1 up mtu 9000
ip link set port0 up
ip link set port0 address 02:00:5e:10:00:01
ip addr add 10.1.2.3/20 dev port0
ip addr add 10.1.2.9/32 dev port0
ip addr add 192.168.7.1 peer 192.168.7.2/32 dev port0
ip addr add 2001:db8::5/64 dev port0 nodad
ip addr add 2001:db8::6/128 dev port0 nodad valid_lft 3600 preferred_lft 1800

ip route add default via 10.1.0.1 metric 70000
ip route add default via 10.1.0.2 metric 100
ip route add 172.16.0.0/12 via 10.1.0.3
ip route add blackhole 172.31.0.0/16
ip route add unreachable 172.30.0.0/16
ip route add 198.51.100.0/24 table 77 via 10.1.0.3
ip -6 route add default via 2001:db8::1
ip -6 route add 2001:db8:1::/48 via 2001:db8::9 metric 5
ip -6 route add blackhole 2001:db8:ff::/48

# Not every kernel has these.
{
    ip link add bridge0 type bridge
    ip link set bridge0 up
    ip link add link port0 name port0.7 type vlan id 7
    ip link set port0.7 up
    ip link add bond0 type bond
    ip link set bond0 up
    ip link add dummy0 type dummy
    ip tuntap add tunnel0 mode tun
    ip route add 203.0.113.0/24 nexthop via 10.1.0.5 nexthop via 10.1.0.6
} 2>/dev/null || true

mount -t tmpfs -o size=8m first /mnt
mkdir "/mnt/with blank" '/mnt/back\slash' /mnt/größe /mnt/part /mnt/twice /mnt/frozen /mnt/in
mount -t tmpfs -o size=1m "a source" "/mnt/with blank"
mount -t tmpfs -o size=2m,ro second '/mnt/back\slash'
mount -t tmpfs -o size=3m,nr_inodes=77 third /mnt/größe
mount -t tmpfs -o size=4m hidden /mnt/twice
mount -t tmpfs -o size=5m seen /mnt/twice
mount -t tmpfs -o size=6m fourth /mnt/frozen
mount -o remount,bind,ro /mnt/frozen
mkdir /mnt/größe/below
mount --bind /mnt/größe/below /mnt/part
mount --bind / /mnt/in

exec "$@"
