drop table KWX_Sensors_Anhc3;

create table KWX_Sensors_Anhc3 (
   HWARE_SYS_ID varchar(64) NOT NULL,
   CFG_CHG_TYPE varchar(12) NOT NULL,
   CFG_CHG_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   Name varchar(24),
   indx varchar(20),
   Shift varchar(20),
   Margin varchar(20),
   Balance varchar(20),
   Ratio varchar(32),
   resourc varchar(255),
   level varchar(255),
   LowestPermittedOpe varchar(32),
   LowestPermittedOpe11 varchar(32),
   TemperatureOfSenso varchar(20),
   TemperatureOfSenso13 varchar(20),
   Name14 varchar(16),
   Label varchar(12),
   Caption varchar(255),
   Kind varchar(255),
   State varchar(255),
   Note varchar(255),
   Mark varchar(32),
   Active varchar(32),
   Built varchar(25),
   Holder varchar(32),
   Name1424 varchar(255),
   Flags varchar(40),
   Octets varchar(255),
   Shifts varchar(255),
   Ports varchar(255),
   Steps varchar(255),
   Counts varchar(255),
   Deltas varchar(255),
   Totals varchar(255),
   Factors varchar(255),
   Weights varchar(255),
   Marks varchar(255),
   Texts varchar(255),
   Moments varchar(255) );

alter table KWX_Sensors_Anhc3 add primary key ( HWARE_SYS_ID, CFG_CHG_TYPE, Row_Index );

drop view KWX_VSensors_Anhc3;

create view KWX_VSensors_Anhc3
as
select
   COMPUTER_SYS.QVE_OBJECT_ID,
   COMPUTER_SYS.QVE_OBJECT_LABEL,
   KWX_Sensors_Anhc3.*
from
   COMPUTER_SYS, KWX_Sensors_Anhc3
where
   COMPUTER_SYS.HWARE_SYS_ID =
   KWX_Sensors_Anhc3.HWARE_SYS_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VSensors_Anhc3');
