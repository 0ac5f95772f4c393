drop table KWX_Sensors_And_Their_Log_hc3
go

create table KWX_Sensors_And_Their_Log_hc3 (
   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Name varchar(24) NULL,
   indx varchar(20) NULL,
   Shift varchar(20) NULL,
   Margin varchar(20) NULL,
   Balance varchar(20) NULL,
   Ratio varchar(32) NULL,
   resourc_ varchar(255) NULL,
   level_ varchar(255) NULL,
   LowestPermittedOperatingVoltag varchar(32) NULL,
   LowestPermittedOperatingVoltag11 varchar(32) NULL,
   TemperatureOfSensorOne varchar(20) NULL,
   TemperatureOfSensorTwo varchar(20) NULL,
   Name14 varchar(16) NULL,
   Label varchar(12) NULL,
   Caption varchar(255) NULL,
   Kind varchar(255) NULL,
   State varchar(255) NULL,
   Note varchar(255) NULL,
   Mark varchar(32) NULL,
   Active varchar(32) NULL,
   Built varchar(25) NULL,
   Holder varchar(32) NULL,
   Name1424 varchar(255) NULL,
   Flags varchar(40) NULL,
   Octets varchar(255) NULL,
   Shifts varchar(255) NULL,
   Ports varchar(255) NULL,
   Steps varchar(255) NULL,
   Counts varchar(255) NULL,
   Deltas varchar(255) NULL,
   Totals varchar(255) NULL,
   Factors varchar(255) NULL,
   Weights varchar(255) NULL,
   Marks varchar(255) NULL,
   Texts varchar(255) NULL,
   Moments varchar(255) NULL )
go

alter table KWX_Sensors_And_Their_Log_hc3 add primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index )
go

drop view KWX_VSensors_And_Their_Log_hc3
go

create view KWX_VSensors_And_Their_Log_hc3
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Sensors_And_Their_Log_hc3.*
from
   COMPUTER_SYSTEM, KWX_Sensors_And_Their_Log_hc3
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Sensors_And_Their_Log_hc3.HARDWARE_SYSTEM_ID
go

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VSensors_And_Their_Log_hc3')
go
