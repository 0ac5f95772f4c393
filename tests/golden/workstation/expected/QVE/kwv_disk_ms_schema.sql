drop table KWX_Fixed_and_removable_disks
go

create table KWX_Fixed_and_removable_disks (
   HARDWARE_SYSTEM_ID varchar(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar(32) NOT NULL,
   Row_Index varchar(5) NOT NULL,
   DeviceID varchar(64) NULL,
   Drive_Name varchar(30) NULL,
   siz_ varchar(20) NULL,
   Removable varchar(32) NULL,
   Name varchar(255) NULL,
   Capacity varchar(20) NULL,
   DeviceID8 varchar(255) NULL,
   Speed varchar(20) NULL )
go

alter table KWX_Fixed_and_removable_disks add primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index )
go

drop view KWX_VFixed_and_removable_disks
go

create view KWX_VFixed_and_removable_disks
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Fixed_and_removable_disks.*
from
   COMPUTER_SYSTEM, KWX_Fixed_and_removable_disks
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Fixed_and_removable_disks.HARDWARE_SYSTEM_ID
go

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VFixed_and_removable_disks')
go
