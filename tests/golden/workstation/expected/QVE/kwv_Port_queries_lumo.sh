echo "Creating query 'Port' in $QUERY_LIB..." 
echo "Creating query 'Port' in $QUERY_LIB..." >> $DBDIR/tmp/kwvinstall.log 
qvmkquery -d "Port" -r inventory -v KWX_VPort \
   -c QVE_OBJECT_LABEL \
   -c Name \
"$QUERY_LIB" "Port" 2>> $DBDIR/tmp/kwvinstall.log
ERR=$?
if [ $ERR -ne 0 ] ; then
   echo "'Port' query already exists."
fi
