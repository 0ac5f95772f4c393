echo "Creating query 'Network_Zones' in $QUERY_LIB..." 
echo "Creating query 'Network_Zones' in $QUERY_LIB..." >> $DBDIR/tmp/kwvinstall.log 
qvmkquery -d "Network_Zones" -r inventory -v KWX_VNET_Zones \
   -c QVE_OBJECT_LABEL \
   -c Name \
   -c State \
   -c Name4 \
   -c Place \
"$QUERY_LIB" "Network Zones" 2>> $DBDIR/tmp/kwvinstall.log
ERR=$?
if [ $ERR -ne 0 ] ; then
   echo "'Network Zones' query already exists."
fi
