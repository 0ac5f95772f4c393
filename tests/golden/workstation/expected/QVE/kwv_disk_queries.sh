echo "Creating query ' 	Fixed and removable disks 	' in $QUERY_LIB..." 
echo "Creating query ' 	Fixed and removable disks 	' in $QUERY_LIB..." >> $DBDIR/tmp/kwvinstall.log 
qvmkquery -d " 	Fixed and removable disks 	" -r inventory -v KWX_VFixed_and_removable_disks \
   -c QVE_OBJECT_LABEL \
   -c DeviceID \
   -c Drive_Name \
   -c siz_ \
   -c Removable \
   -c Name \
   -c Capacity \
   -c DeviceID8 \
   -c Speed \
"$QUERY_LIB" "Disk Data" 2>> $DBDIR/tmp/kwvinstall.log
ERR=$?
if [ $ERR -ne 0 ] ; then
   echo "'Disk Data' query already exists."
fi
