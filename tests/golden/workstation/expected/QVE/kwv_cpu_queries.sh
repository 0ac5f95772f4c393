echo "Creating query 'Processor_Data' in $QUERY_LIB..." 
echo "Creating query 'Processor_Data' in $QUERY_LIB..." >> $DBDIR/tmp/kwvinstall.log 
qvmkquery -d "Processor_Data" -r inventory -v KWX_VProcessor_Data \
   -c QVE_OBJECT_LABEL \
   -c Processor_identifier__unique_ \
   -c Family \
   -c CPUStatus \
   -c Family5 \
   -c MaxClockSpeed \
   -c CacheSize \
   -c LoadPercentage \
   -c Temperature \
   -c Cooled \
   -c Voltage \
   -c Grade \
   -c InstallDate \
   -c Uptime \
   -c PowerManagementCapabilities \
   -c Numbers \
   -c Notes \
   -c Host \
   -c SerialNumber \
   -c Elsewhere \
   -c Extra \
   -c siz_ \
   -c Description \
"$QUERY_LIB" "Processor Data" 2>> $DBDIR/tmp/kwvinstall.log
ERR=$?
if [ $ERR -ne 0 ] ; then
   echo "'Processor Data' query already exists."
fi
