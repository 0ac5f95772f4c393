echo "Creating query ' 	Fixed and removable disks 	' in $QUERY_LIB..." 
echo "Creating query ' 	Fixed and removable disks 	' in $QUERY_LIB..." >> $DBDIR/tmp/kwvinstall.log 
qvmkquery -d " 	Fixed and removable disks 	" -r inventory -v KWX_VFixed_and_cz9 \
   -c QVE_OBJECT_LABEL \
   -c DEV \
   -c DRV_Name \
   -c siz \
   -c Removable \
   -c Name \
   -c Capacity \
   -c DEV \
   -c Speed \
"$QUERY_LIB" "Disk Data" 2>> $DBDIR/tmp/kwvinstall.log
ERR=$?
if [ $ERR -ne 0 ] ; then
   echo "'Disk Data' query already exists."
fi
